// A Kotlin app as the typed layer should feel in it: what may be null is asked for, what may not is
// used as it is, and nothing warns.
import com.brindlex.kernel.quorvane.NativeLibrary
import com.brindlex.kernel.quorvane.client.*
import java.math.BigDecimal

class Screen {
    val lines = mutableListOf<String>()

    fun show(line: String) {
        lines += line
    }
}

fun requests(): Requests =
    Requests.of(Session.of("SN0001", "10.0.0.1"), Credentials.of("9A01", "A123456789", "1234567", "pass1234"))

fun <T : Any> Reply<T>.onScreen(screen: Screen, shown: (T) -> Unit) = when (outcome()) {
    Reply.Outcome.RESULT -> shown(orThrow())
    Reply.Outcome.ON_ITS_WAY -> screen.show("on its way: ${message()}")
    Reply.Outcome.FAILURE -> screen.show(failure()?.run { "${source()} ${code()} ${text()}" } ?: message())
}

fun place(screen: Screen, send: (String) -> String?) {
    val order: Request<StockOrderReceipt> = requests().stockOrder()
        .buy("2330")
        .quantity(Quantity.lots(2))
        .price(Price.of(BigDecimal("995.5")))
        .live()
        .build()
    order.read(send(order.text())).onScreen(screen) { receipt ->
        val date: TradeDate? = receipt.orderDate()
        screen.show("number ${receipt.gatewayNumber().length} of ${date?.year() ?: 0}")
    }
}

fun book(screen: Screen, send: (String) -> String?) {
    val request = requests().stockOrders(TradeDate.today())
    request.read(send(request.text())).onScreen(screen) { orders ->
        for (order in orders) {
            val state = when (order.state()?.value()) {
                OrderStatus.ACCEPTED -> "live"
                OrderStatus.RESERVED -> "reserved"
                OrderStatus.UNKNOWN, null -> "?"
                else -> order.state().toString()
            }
            val price: Price? = order.price()
            val quantity: Long = order.orderedQuantity() ?: 0
            screen.show("${order.stockCode()} $quantity $price $state")
        }
    }
}

fun refused(): List<Problem> = try {
    requests().futuresOrder().buy(Contract.futures("TXF", "202401")).price(Price.MARKET).build()
    emptyList()
} catch (refusal: InvalidRequestException) {
    refusal.problems()
}

fun main() {
    NativeLibrary.use(NativeLibrary.Loader { name -> System.loadLibrary(name) })
    val screen = Screen()
    NativeLibrary.whyNot()?.let { return println(it) }
    place(screen) { "" }
    place(screen) { "|39=E|19=|K1=庫存不足|" }
    book(screen) { "[GATEWAY]error" }
    screen.show(refused().joinToString { it.argument() })
    screen.lines.forEach(::println)
}
