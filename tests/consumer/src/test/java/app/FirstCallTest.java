package app;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertNull;
import static org.junit.jupiter.api.Assertions.assertTrue;

import com.brindlex.kernel.quorvane.NativeLibrary;
import com.brindlex.kernel.quorvane.client.Accounts;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.client.Session;
import org.junit.jupiter.api.Test;

class FirstCallTest {
    private static Request<Accounts> login() {
        return Requests.of(Session.of("SN0001", "10.0.0.1"),
                Credentials.of("9A00", "A123456789", "1234567", "secret")).login();
    }

    @Test
    void theLibraryIsThere() {
        assertNull(NativeLibrary.whyNot());
    }

    @Test
    void aLoginIsWritten() {
        assertTrue(login().text().contains("|IDNO=A123456789|ACNO=1234567|PWD=secret|"));
    }

    @Test
    void itsReplyIsRead() {
        Reply<Accounts> reply = login().read(
                "|68=0000|00=1|68=0000|07=S|M5=Main|16=9A00|17=123|18=4567|69=1|67=1|01=");
        assertEquals("1234567", reply.orThrow().get(0).account());
    }
}
