import com.brindlex.kernel.quorvane.client.*
import com.brindlex.kernel.quorvane.simulator.*
import org.junit.jupiter.api.Assertions.assertEquals
import org.junit.jupiter.api.Test

class LoginTest {
    private val gateway = Gateway.open()
    private val login = Requests.of(Session.of("SN0001", "10.0.0.1"), ReadyMade.STOCK_USER).login()

    @Test
    fun `a login lists the accounts`() {
        val accounts = login.read(gateway.answer(login.text())).orThrow()
        assertEquals(listOf("1234567", "0009876", "7654321"), accounts.map { it.account() })
    }

    @Test
    fun `a login that is cut short fails`() {
        gateway.disturbNext(Disturbance.cut(20))
        assertEquals(Reply.Outcome.FAILURE, login.read(gateway.answer(login.text())).outcome())
    }
}
