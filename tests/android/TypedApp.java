import com.brindlex.kernel.quorvane.client.Account;
import com.brindlex.kernel.quorvane.client.Contract;
import com.brindlex.kernel.quorvane.client.Credentials;
import com.brindlex.kernel.quorvane.client.InvalidRequestException;
import com.brindlex.kernel.quorvane.client.Price;
import com.brindlex.kernel.quorvane.client.Quantity;
import com.brindlex.kernel.quorvane.client.Reply;
import com.brindlex.kernel.quorvane.client.Request;
import com.brindlex.kernel.quorvane.client.Requests;
import com.brindlex.kernel.quorvane.client.Session;
import com.brindlex.kernel.quorvane.client.StockOrder;
import com.brindlex.kernel.quorvane.client.StockOrderReceipt;
import com.brindlex.kernel.quorvane.client.TradeDate;

/** An app that uses the typed layer from login to cancellation, on replies that it brings along. */
final class TypedApp {
    private static final String LOGIN =
            "|68=0000|00=1|68=0000|07=S|M5=Main|16=9A01|17=123|18=4567|69=1|67=1|01=";
    private static final String BOOK = "|00=1|68=0000|67=1|46=G1|36=A0001|27=0|28=0|32=B|29=2330"
            + "|70=2000|37=0|41=0|47=0|39= |K1=|N6=1|31=600.5|M8=0|22=090000|21=20240115"
            + "|44=20240115|JV=Y|01=|00=2|67=900000|68=0000|01=";

    private TypedApp() {}

    public static void main(String[] arguments) {
        Requests requests = Requests.of(Session.of("SN0001", "10.0.0.1"),
                Credentials.of("9A01", "A123456789", "1234567", "secret"));
        for (Account account : requests.login().read(LOGIN).orThrow()) {
            System.out.println(account);
        }
        Request<StockOrderReceipt> order = requests.stockOrder().buy("2330")
                .quantity(Quantity.lots(2)).price(Price.of("600.5")).live().build();
        System.out.println(order.text().replaceAll("[0-9]{6,}", "N"));
        Reply<StockOrderReceipt> receipt = order.read("|39= |19=S|46=G1|44=20240115|");
        System.out.println(receipt + " " + receipt.outcome() + " " + order.read(""));
        StockOrder listed =
                requests.stockOrders(TradeDate.of(2024, 1, 15)).read(BOOK).orThrow().get(0);
        System.out.println(listed + " " + listed.state().value());
        System.out.println(requests.cancel(listed).flag13('0').build().text()
                .replaceAll("[0-9]{6,}", "N"));
        try {
            requests.futuresOrder().buy(Contract.futures("TXF", "202401")).quantity(0).build();
        } catch (InvalidRequestException refused) {
            System.out.println(refused.problems());
        }
        System.out.println(requests.margin().read("[GATEWAY]error").failure());
    }
}
