import com.brindlex.kernel.quorvane.NativeLibrary;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.client.Session;
import java.io.File;
import java.net.URL;
import java.net.URLClassLoader;
import java.util.ArrayList;
import java.util.Collections;
import java.util.List;
import java.util.concurrent.Callable;
import java.util.concurrent.ExecutorService;
import java.util.concurrent.Executors;
import java.util.concurrent.Future;

/** Loads the library as an app's test does: Load [LOADERS]. Prints "good", or why not. */
public final class Load {
    public static void main(String[] arguments) throws Exception {
        // the virtual machine takes its name from no option
        System.setProperty("java.vm.name",
                System.getProperty("pretend.vm", System.getProperty("java.vm.name")));
        if (arguments.length > 0) {
            many(Integer.parseInt(arguments[0]));
            return;
        }
        System.out.println(answer());
    }

    public static String answer() {
        String why = NativeLibrary.whyNot();
        if (why != null) {
            return why;
        }
        String login = Requests.of(Session.of("SN0001", "10.0.0.1"),
                Credentials.of("9A00", "A123456789", "1234567", "secret")).login().text();
        return login.startsWith("F=7|") ? "good" : login;
    }

    /** As many class loaders at once, each of which has loaded nothing yet. */
    private static void many(int loaders) throws Exception {
        List<URL> path = new ArrayList<>();
        for (String file : System.getProperty("java.class.path").split(File.pathSeparator)) {
            path.add(new File(file).toURI().toURL());
        }
        ExecutorService threads = Executors.newFixedThreadPool(loaders);
        List<Future<Object>> answers = threads.invokeAll(Collections.nCopies(
                loaders, (Callable<Object>) () ->
                        new URLClassLoader(path.toArray(new URL[0]), null)
                                .loadClass("Load").getMethod("answer").invoke(null)));
        for (Future<Object> answer : answers) {
            System.out.println(answer.get());
        }
        threads.shutdown();
    }
}
