// What must not compile in Kotlin: each line that ends with a mark, and no other.
import com.brindlex.kernel.quorvane.client.*

fun wrong(requests: Requests, order: StockOrder, fill: StockFill, day: TradeDate) {
    val shown: Price = order.price() // wrong: it may be null
    val late: Int = order.entryTime().hour() // wrong: it may be null
    val right: String = order.stockCode()
    val orders: Reply<StockOrders> = requests.stockOrders(day).read("")
    val fills: Reply<StockFills> = requests.stockOrders(day).read("") // wrong: another reply
    order.get(StockOrder.PRICE)
    order.get(StockFill.FILL_PRICE) // wrong: another row's column
    requests.cancel(order)
    requests.cancel(fill) // wrong: a fill cannot be cancelled
    requests.changePrice(order, Price.FLAT) // wrong: a stock order keeps its price
    requests.stockOrder().price(Price.FLAT).quantity(Quantity.lots(1))
    requests.stockOrder().price("600.5") // wrong: a price is no text
    requests.stockOrder().orderKind(TradeType.LOTS) // wrong: another code
    Credentials.of("9A01", "A123456789", "1234567", null) // wrong: a password is there
    println("$shown $late $right $orders $fills")
}
