package com.brindlex.kernel.quorvane.typed;

import com.brindlex.kernel.quorvane.gatewayjni;
import com.brindlex.kernel.quorvane.typed.Wire.Header;
import java.util.ArrayList;
import java.util.Arrays;
import java.util.Collections;
import java.util.LinkedHashSet;
import java.util.List;
import java.util.Set;

/**
 * The 59 operations of the library: what each is for, its arguments, the forms of its request or
 * the layout of its result. Requests, results, the console and the documents all read this table.
 */
public enum Operation {
    AUTH_ENCODE("AuthEncode", "login", Argument.ACCOUNT, Header.QUERY,
            (s, r, status) -> gatewayjni.AuthEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), status),
            "FUNC=0|01="),
    GET_TOTAL_ACCOUNT_ENCODE("GetTotalAccountEncode", "list of all trading accounts",
            Argument.ACCOUNT, Header.QUERY,
            (s, r, status) -> gatewayjni.GetTotalAccountEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), status),
            "FUNC=12|01="),
    OPEN_ACCOUNT_ENCODE("OpenAccountEncode", "opening of an account",
            Argument.APPLICANT, Header.QUERY,
            (s, r, status) -> gatewayjni.OpenAccountEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.text(5), r.octet(6),
                    r.octet(7), status),
            "FUNC=9|NAME=*|ADDRESS=*|TEL=*|TIME=*|ITEM=*|01="),
    CHANGE_PASSWORD_ENCODE("ChangePasswordEncode", "change of the trading password",
            Argument.NEW_PASSWORD, Header.QUERY,
            (s, r, status) -> gatewayjni.ChangePasswordEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), status),
            "FUNC=1|54=*|55=*|01="),
    QUERY_BANK_REMAIN_ENCODE("QueryBankRemainEncode", "balance of the linked bank account",
            Argument.ACCOUNT, Header.QUERY,
            (s, r, status) -> gatewayjni.QueryBankRemainEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), status),
            "FUNC=7|01="),
    REGISTER_CERT_ENCODE("RegisterCertEncode", "registration of a certificate",
            Argument.CERTIFICATE_ONLY, Header.QUERY,
            (s, r, status) -> gatewayjni.RegisterCertEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), status),
            "FUNC=10|MSG=*|01="),
    GET_CERT_ENCODE("GetCertEncode", "fetching of a certificate",
            Argument.CERTIFICATE_ONLY, Header.QUERY,
            (s, r, status) -> gatewayjni.GetCertEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), status),
            "FUNC=11|MSG=*|01="),
    GET_CERT_ENCODE2("GetCertEncode2", "fetching of a certificate, long message",
            Argument.CERTIFICATE_ONLY, Header.QUERY,
            (s, r, status) -> gatewayjni.GetCertEncode2(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), status),
            "FUNC=11|MSG=*|01="),
    APPLY_CERT_ENCODE("ApplyCertEncode", "application for a certificate",
            Argument.CERTIFICATE_HOLDER, Header.QUERY,
            (s, r, status) -> gatewayjni.ApplyCertEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), status),
            "FUNC=13|MSG=*|BIRTH=*|01="),
    GET_CERT_STATUS_ENCODE("GetCertStatusEncode", "state of a certificate",
            Argument.CERTIFICATE_ONLY, Header.QUERY,
            (s, r, status) -> gatewayjni.GetCertStatusEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), status),
            "FUNC=14|MSG=*|01="),
    RENEW_CERT_ENCODE("ReNewCertEncode", "renewal of a certificate",
            Argument.CERTIFICATE_HOLDER, Header.QUERY,
            (s, r, status) -> gatewayjni.ReNewCertEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), status),
            "FUNC=15|MSG=*|BIRTH=*|01="),
    INSTALL_CERT_OK_ENCODE("InstallCertOKEncode", "confirmation that a certificate is installed",
            Argument.CERTIFICATE_ONLY, Header.QUERY,
            (s, r, status) -> gatewayjni.InstallCertOKEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), status),
            "FUNC=16|MSG=*|01="),
    OPEN_CERT_ENCODE("OpenCertEncode", "confirmation that a certificate is opened",
            Argument.CERTIFICATE_ONLY, Header.QUERY,
            (s, r, status) -> gatewayjni.OpenCertEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), status),
            "FUNC=17|MSG=*|01="),
    REVOKE_CERT_ENCODE("RevokeCertEncode", "revocation of a certificate",
            Argument.CERTIFICATE_HOLDER, Header.QUERY,
            (s, r, status) -> gatewayjni.RevokeCertEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), status),
            "FUNC=18|MSG=*|BIRTH=*|01="),
    SUBMIT_ORDER_ENCODE("SubmitOrderEncode", "new stock order", Argument.STOCK_ORDER, Header.ORDER,
            (s, r, status) -> gatewayjni.SubmitOrderEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.number(5), r.number(6),
                    r.number(7), r.octet(8), r.octet(9), r.octet(10), r.octet(11), r.octet(12),
                    r.octet(13), status),
            Wire.STOCK_NEW),
    SUBMIT_ORDER_ENCODE1("SubmitOrderEncode1", "new stock order, signature in tag PL",
            Argument.STOCK_ORDER, Header.ORDER_1,
            (s, r, status) -> gatewayjni.SubmitOrderEncode1(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.number(5), r.number(6),
                    r.number(7), r.octet(8), r.octet(9), r.octet(10), r.octet(11), r.octet(12),
                    r.octet(13), status),
            Wire.STOCK_NEW_1),
    SUBMIT_ORDER_ENCODE2("SubmitOrderEncode2", "short notice of a stock order",
            Argument.STOCK_NOTICE, Header.ORDER_2,
            (s, r, status) -> gatewayjni.SubmitOrderEncode2(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.octet(3), r.octet(4)),
            "*|28=*"),
    CANCEL_ORDER_ENCODE("CancelOrderEncode", "cancellation of a stock order",
            Argument.STOCK_CHANGE, Header.ORDER,
            (s, r, status) -> gatewayjni.CancelOrderEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.text(5), r.number(6),
                    r.number(7), r.number(8), r.octet(9), r.octet(10), r.octet(11), r.octet(12),
                    r.octet(13), r.octet(14), status),
            Wire.STOCK_CANCEL),
    CANCEL_ORDER_ENCODE1("CancelOrderEncode1", "cancellation of a stock order, signature in tag PL",
            Argument.STOCK_CHANGE, Header.ORDER_1,
            (s, r, status) -> gatewayjni.CancelOrderEncode1(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.text(5), r.number(6),
                    r.number(7), r.number(8), r.octet(9), r.octet(10), r.octet(11), r.octet(12),
                    r.octet(13), r.octet(14), status),
            Wire.STOCK_CANCEL_1),
    CHANGE_ORDER_ENCODE("ChangeOrderEncode", "change of a stock order",
            Argument.STOCK_CHANGE, Header.ORDER,
            (s, r, status) -> gatewayjni.ChangeOrderEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.text(5), r.number(6),
                    r.number(7), r.number(8), r.octet(9), r.octet(10), r.octet(11), r.octet(12),
                    r.octet(13), r.octet(14), status),
            Wire.STOCK_CHANGE),
    CHANGE_ORDER_ENCODE1("ChangeOrderEncode1", "change of a stock order, signature in tag PL",
            Argument.STOCK_CHANGE, Header.ORDER_1,
            (s, r, status) -> gatewayjni.ChangeOrderEncode1(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.text(5), r.number(6),
                    r.number(7), r.number(8), r.octet(9), r.octet(10), r.octet(11), r.octet(12),
                    r.octet(13), r.octet(14), status),
            Wire.STOCK_CHANGE_1),
    QUERY_ORDER_ENCODE("QueryOrderEncode", "stock order book of one day",
            Argument.STOCK_DAY, Header.QUERY,
            (s, r, status) -> gatewayjni.QueryOrderEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.number(4), status),
            "|FUNC=2|SDATE=*|EDATE=*|28=*|01=\n"),
    QUERY_REPLY_ENCODE("QueryReplyEncode", "stock fills of a period", Argument.PERIOD, Header.QUERY,
            (s, r, status) -> gatewayjni.QueryReplyEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), status),
            "|FUNC=3|57=2|SDATE=*|EDATE=*|01=\n"),
    QUERY_INVENTORY_ENCODE("QueryInventoryEncode", "stock positions",
            Argument.ACCOUNT, Header.QUERY,
            (s, r, status) -> gatewayjni.QueryInventoryEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), status),
            "|FUNC=5|01="),
    QUERY_CREDIT_INFO_ENCODE("QueryCreditInfoEncode", "credit figures of one stock",
            Argument.ONE_STOCK, Header.QUERY,
            (s, r, status) -> gatewayjni.QueryCreditInfoEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), status),
            "|FUNC=8|29=*|01="),
    PAYMENT_ENCODE("PaymentEncode", "stock settlement of a period",
            Argument.SETTLEMENT_PERIOD, Header.QUERY,
            (s, r, status) -> gatewayjni.PaymentEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), status),
            "|FUNC=6|H4=1|SDATE=*|EDATE=*|01="),
    FUT_SUBMIT_ORDER_ENCODE("FutSubmitOrderEncode", "futures or options order",
            Argument.FUTURES_ORDER, Header.ORDER,
            (s, r, status) -> gatewayjni.FutSubmitOrderEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.text(5), r.text(6),
                    r.text(7), r.text(8), r.text(9), r.text(10), r.text(11), r.text(12),
                    r.octet(13), r.octet(14), r.octet(15), r.letter(16), r.letter(17), r.letter(18),
                    r.letter(19), r.letter(20), r.letter(21), r.number(22), r.number(23),
                    r.number(24), status),
            Wire.FUTURES),
    FUT_SUBMIT_ORDER_ENCODE1("FutSubmitOrderEncode1",
            "futures or options order, signature in tag PL",
            Argument.FUTURES_ORDER, Header.ORDER_1,
            (s, r, status) -> gatewayjni.FutSubmitOrderEncode1(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), r.text(5), r.text(6),
                    r.text(7), r.text(8), r.text(9), r.text(10), r.text(11), r.text(12),
                    r.octet(13), r.octet(14), r.octet(15), r.letter(16), r.letter(17), r.letter(18),
                    r.letter(19), r.letter(20), r.letter(21), r.number(22), r.number(23),
                    r.number(24), status),
            Wire.FUTURES_1),
    FUT_QUERY_ORDER_ENCODE("FutQueryOrderEncode", "futures order book of one day",
            Argument.FUTURES_DAY, Header.QUERY,
            (s, r, status) -> gatewayjni.FutQueryOrderEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.number(4), status),
            "FUNC=x|FUNC1=0|SDATE=*||EDATE=*|28=*|01="),
    FUT_QUERY_REPLY_ENCODE("FutQueryReplyEncode", "futures fills of a period",
            Argument.PERIOD, Header.QUERY,
            (s, r, status) -> gatewayjni.FutQueryReplyEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.text(3), r.text(4), status),
            "FUNC=x|FUNC1=1|SDATE=*|EDATE=*|01=\n"),
    FUT_QUERY_INVENTORY_ENCODE("FutQueryInventoryEncode", "futures and options positions",
            Argument.ACCOUNT, Header.QUERY,
            (s, r, status) -> gatewayjni.FutQueryInventoryEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), status),
            "FUNC=O|01="),
    QUERY_FINANCE_ENCODE("QueryFinanceEncode", "margin account", Argument.MARGIN, Header.QUERY,
            (s, r, status) -> gatewayjni.QueryFinanceEncode(
                    s.market, s.platform, s.sequence, s.serialNumber, s.localAddress,
                    r.text(0), r.text(1), r.text(2), r.number(3), status),
            "FUNC=P|28=*|01="),
    AUTH_DECODE("AuthDecode", "accounts of the user, perhaps a notice", Argument.REPLY_ONLY,
            Layout.list(Accounts.TABLE, Accounts.NOTICES), Wire.LIST,
            (market, reply, status) -> gatewayjni.AuthDecode(reply, status)),
    GET_TOTAL_ACCOUNT_DECODE("GetTotalAccountDecode", "all trading accounts", Argument.REPLY_ONLY,
            Layout.list(Accounts.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.GetTotalAccountDecode(reply, status)),
    OPEN_ACCOUNT_DECODE("OpenAccountDecode", "outcome of an account opening", Argument.REPLY_ONLY,
            Layout.EMPTY, Wire.LIST,
            (market, reply, status) -> gatewayjni.OpenAccountDecode(reply, status)),
    CHANGE_PASSWORD_DECODE("ChangePasswordDecode", "outcome of a password change",
            Argument.REPLY_ONLY,
            Layout.EMPTY, Wire.LIST,
            (market, reply, status) -> gatewayjni.ChangePasswordDecode(reply, status)),
    QUERY_BANK_REMAIN_DECODE("QueryBankRemainDecode", "balance of the linked bank account",
            Argument.REPLY_ONLY,
            Layout.list(BankBalance.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.QueryBankRemainDecode(reply, status)),
    REGISTER_CERT_DECODE("RegisterCertDecode", "answer to a registration", Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.RegisterCertDecode(reply, status)),
    GET_CERT_DECODE("GetCertDecode", "the certificate", Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.GetCertDecode(reply, status)),
    APPLY_CERT_DECODE("ApplyCertDecode", "answer to an application", Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.ApplyCertDecode(reply, status)),
    GET_CERT_STATUS_DECODE("GetCertStatusDecode", "state of the certificate", Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.GetCertStatusDecode(reply, status)),
    RENEW_CERT_DECODE("ReNewCertDecode", "answer to a renewal", Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.ReNewCertDecode(reply, status)),
    INSTALL_CERT_OK_DECODE("InstallCertOKDecode", "answer to an installation report",
            Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.InstallCertOKDecode(reply, status)),
    OPEN_CERT_DECODE("OpenCertDecode", "answer to an opening report", Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.OpenCertDecode(reply, status)),
    REVOKE_CERT_DECODE("RevokeCertDecode", "answer to a revocation", Argument.REPLY_ONLY,
            Layout.TEXT, Wire.LIST,
            (market, reply, status) -> gatewayjni.RevokeCertDecode(reply, status)),
    SUBMIT_ORDER_DECODE("SubmitOrderDecode", "receipt of a new stock order", Argument.REPLY_ONLY,
            Layout.record(OrderReceipts.STOCK), Wire.RECEIPT,
            (market, reply, status) -> gatewayjni.SubmitOrderDecode(reply, status)),
    CANCEL_CHANGE_ORDER_DECODE("CancelChangeOrderDecode", "outcome of a cancellation or change",
            Argument.REPLY_ONLY,
            Layout.EMPTY, Wire.RECEIPT,
            (market, reply, status) -> gatewayjni.CancelChangeOrderDecode(reply, status)),
    QUERY_ORDER_DECODE("QueryOrderDecode", "stock order book", Argument.MARKET_AND_REPLY,
            Layout.list(StockOrders.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.QueryOrderDecode(market, reply, status)),
    QUERY_REPLY_DECODE("QueryReplyDecode", "stock fills", Argument.REPLY_ONLY,
            Layout.list(StockFills.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.QueryReplyDecode(reply, status)),
    QUERY_INVENTORY_DECODE("QueryInventoryDecode", "stock positions", Argument.REPLY_ONLY,
            Layout.sections(0, StockPositions.CASH, StockPositions.MARGIN,
                    StockPositions.SHORT_SALE, StockPositions.OTHER), Wire.LIST,
            (market, reply, status) -> gatewayjni.QueryInventoryDecode(reply, status)),
    QUERY_INVENTORY_DECODE_JZG("QueryInventoryDecodeJZG", "stock positions at brokerage JZG",
            Argument.REPLY_ONLY,
            Layout.sections(0, StockPositions.CASH_JZG, StockPositions.MARGIN_JZG,
                    StockPositions.SHORT_SALE_JZG), Wire.LIST,
            (market, reply, status) -> gatewayjni.QueryInventoryDecodeJZG(reply, status)),
    QUERY_CREDIT_INFO_DECODE("QueryCreditInfoDecode", "credit figures of one stock",
            Argument.REPLY_ONLY,
            Layout.record(CreditFigures.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.QueryCreditInfoDecode(reply, status)),
    PAYMENT_DECODE("PaymentDecode", "settled trades", Argument.REPLY_ONLY,
            Layout.list(Settlements.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.PaymentDecode(reply, status)),
    PAYMENT_DECODE_JZG("PaymentDecodeJZG", "settled trades at brokerage JZG", Argument.REPLY_ONLY,
            Layout.list(Settlements.TABLE_JZG), Wire.LIST,
            (market, reply, status) -> gatewayjni.PaymentDecodeJZG(reply, status)),
    FUT_SUBMIT_ORDER_DECODE("FutSubmitOrderDecode", "receipt of a futures order",
            Argument.REPLY_ONLY,
            Layout.record(OrderReceipts.FUTURES), Wire.RECEIPT,
            (market, reply, status) -> gatewayjni.FutSubmitOrderDecode(reply, status)),
    FUT_QUERY_ORDER_DECODE("FutQueryOrderDecode", "futures order book", Argument.REPLY_ONLY,
            Layout.list(FuturesOrders.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.FutQueryOrderDecode(reply, status)),
    FUT_QUERY_REPLY_DECODE("FutQueryReplyDecode", "futures fills", Argument.REPLY_ONLY,
            Layout.list(FuturesFills.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.FutQueryReplyDecode(reply, status)),
    FUT_QUERY_INVENTORY_DECODE("FutQueryInventoryDecode", "futures and options positions",
            Argument.REPLY_ONLY,
            Layout.sections(5, FuturesPositions.FUTURES, FuturesPositions.OPTIONS), Wire.LIST,
            (market, reply, status) -> gatewayjni.FutQueryInventoryDecode(reply, status)),
    QUERY_FINANCE_DECODE("QueryFinanceDecode", "the margin account", Argument.REPLY_ONLY,
            Layout.list(Margins.TABLE), Wire.LIST,
            (market, reply, status) -> gatewayjni.QueryFinanceDecode(reply, status));

    /** Calls an encoder. */
    interface Encoder {
        String encode(Session s, Request r, int[] status);
    }

    /** Calls a decoder. */
    interface Decoder {
        String decode(int market, String reply, int[] status);
    }

    private static final String ENCODE = "Encode";

    private final String method;
    private final String summary;
    private final List<Argument> arguments;
    private final Encoder encoder;
    private final List<String> forms;
    private final Decoder decoder;
    private final Layout layout;
    private final String frame;

    Operation(String method, String summary, Argument[] arguments, Header header, Encoder encoder,
            String... tails) {
        this.method = method;
        this.summary = summary;
        this.arguments = Collections.unmodifiableList(Arrays.asList(arguments));
        this.encoder = encoder;
        this.forms = Wire.forms(header, tails);
        this.decoder = null;
        this.layout = Layout.EMPTY;
        this.frame = "";
    }

    Operation(String method, String summary, Argument[] arguments, Layout layout, String frame,
            Decoder decoder) {
        this.method = method;
        this.summary = summary;
        this.arguments = Collections.unmodifiableList(Arrays.asList(arguments));
        this.encoder = null;
        this.forms = Collections.emptyList();
        this.decoder = decoder;
        this.layout = layout;
        this.frame = frame;
    }

    /** The operation of a native method, or null. */
    public static Operation named(String method) {
        for (Operation operation : values()) {
            if (operation.method.equals(method)) {
                return operation;
            }
        }
        return null;
    }

    /** The name of the native method. */
    public String method() {
        return method;
    }

    /** What it is for, in a few words. */
    public String summary() {
        return summary;
    }

    /** Whether it builds a request; else it reads a reply. */
    public boolean isEncoder() {
        return encoder != null;
    }

    /** Its own arguments: those behind the five leading ones of an encoder. */
    public List<Argument> arguments() {
        return arguments;
    }

    /** All arguments of the native method but the status array. */
    public List<Argument> allArguments() {
        List<Argument> all = new ArrayList<Argument>();
        if (isEncoder()) {
            Collections.addAll(all, Argument.leading());
        }
        all.addAll(arguments);
        return all;
    }

    /** Whether the native method takes a status array; one does not. */
    public boolean hasStatus() {
        return this != SUBMIT_ORDER_ENCODE2;
    }

    /**
     * The forms of the request: its text with {@code *} for a value and {@code ~} where two fields
     * meet without a bar. None for a decoder.
     */
    public List<String> requestForms() {
        return forms;
    }

    /** How the result of a decoder is put together. */
    public Layout layout() {
        return layout;
    }

    /** The tags that a decoder reads from a reply. */
    public Set<String> replyTags() {
        Set<String> tags = new LinkedHashSet<String>(Arrays.asList(frame.split(" ")));
        for (Table table : layout.tables()) {
            for (Column<?> column : table.columns()) {
                Collections.addAll(tags, column.tags().split(" "));
            }
        }
        tags.remove("");
        return tags;
    }

    /** The decoders that read the replies to an encoder's requests. */
    public List<Operation> decoders() {
        if (!isEncoder()) {
            return Collections.emptyList();
        }
        String base = method.substring(0, method.indexOf(ENCODE));
        if (base.equals("CancelOrder") || base.equals("ChangeOrder")) {
            return Collections.singletonList(CANCEL_CHANGE_ORDER_DECODE);
        }
        List<Operation> found = new ArrayList<Operation>();
        for (Operation operation : values()) {
            if (operation.method.equals(base + "Decode")
                    || operation.method.equals(base + "DecodeJZG")) {
                found.add(operation);
            }
        }
        return found;
    }

    /**
     * Reads a reply.
     *
     * @throws IllegalStateException when this operation is an encoder
     */
    public Result decode(String reply) {
        return decode(0, reply);
    }

    /**
     * Reads a reply; only the stock order book looks at the market code.
     *
     * @throws IllegalStateException when this operation is an encoder
     */
    public Result decode(int market, String reply) {
        if (decoder == null) {
            throw new IllegalStateException(method + " reads no replies");
        }
        int[] status = {0};
        String text = decoder.decode(market, reply, status);
        return Result.of(this, status[0], text);
    }

    /** Builds the request. */
    Encoded encode(Session session, Request request) {
        int[] status = {1};
        String text = encoder.encode(session, request, status);
        // the one encoder without a status gives its message in place of the header
        boolean refused = !hasStatus() && text.startsWith("[");
        return new Encoded(refused ? -1 : status[0], text);
    }

    @Override
    public String toString() {
        return method;
    }
}
