import com.brindlex.kernel.quorvane.gatewayjni;

/** An app that calls two of the natives and nothing of the typed layer. */
final class App {
    private App() {}

    public static void main(String[] arguments) {
        int[] status = new int[1];
        String request = gatewayjni.AuthEncode(
                0, 0, 1, "SN", "10.0.0.1", "0000", arguments[0], arguments[1], status);
        System.out.println(request + status[0]);
        System.out.println(gatewayjni.AuthDecode(request, status));
    }
}
