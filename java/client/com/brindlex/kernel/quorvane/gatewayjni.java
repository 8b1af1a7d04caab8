package com.brindlex.kernel.quorvane;

/**
 * The message codec between the trading application and a broker's gateway.
 *
 * <p>For each operation an <em>encoder</em> turns the user's input into one request string, and a
 * <em>decoder</em> turns the gateway's reply into one compact result string that the screen lays
 * out. The library holds no connection and no state: sending and receiving is the caller's, and
 * calls from several threads run side by side.
 *
 * <h2>Every encoder</h2>
 *
 * takes five leading parameters ({@code market}, {@code platform}, {@code seqNo}, {@code serialNo},
 * {@code localIP}), then those of the operation, and last {@code status}. Futures encoders add 100
 * to {@code market}, so that one market code of the caller serves both sides.
 *
 * <h2>The identity text</h2>
 *
 * holds an ID number and an account, in either order, joined by {@code &}:
 * {@code "A123456789&1234567"}. ID numbers have 8 to 10 characters, accounts 2 to 7 digits. A part
 * may be empty: {@code "1234567&"} names the account alone. The {@code &} must be there for queries
 * and account operations; order requests also take a lone account or ID number.
 *
 * <h2>Results and status</h2>
 *
 * {@code status[0]} is 1 for success and -1 for failure. On failure the returned text is the
 * message to show, in Traditional Chinese, usually with its source in front: {@code [CLIENT]} this
 * device, {@code [GATEWAY]} the gateway, {@code [BROKER]} the broker's host, {@code [CERT]} the
 * certificate office. In results {@code @} separates fields, {@code !} ends a record and
 * {@code count!} opens a list; {@code <n>!count!} opens a section.
 *
 * <h2>Arguments</h2>
 *
 * A {@code null} text counts as an empty one. {@code status} must be an array of at least one
 * element. Nothing is thrown. Characters travel as UTF-8; {@code |} separates the fields of a
 * request and must not stand in a text.
 *
 * <p>The library writes requests, replies and results, passwords included, to the Android debug log
 * under the tag {@code gatewayjni} unless it was built without logging.
 */
public final class gatewayjni {
    static {
        NativeLibrary.load();
    }

    // Everything is static.
    private gatewayjni() {}

    // ---- login and accounts ----------------------------------------------------------------

    /**
     * Builds the login request (function 0).
     *
     * <p>Fails with a message of the library when the account text is unusable or the device has
     * no address.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #AuthDecode
     */
    public static native String AuthEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, int[] status);

    /**
     * Reads the reply to a login as the list of the user's accounts.
     *
     * <p>Layout: a count and {@code !}, then one record per account, {@code
     * <class>@label@account@branch@flag!} (tags 07, M5, 17 and 18 joined and padded to seven
     * digits, 16, 69). A notice of the broker is counted as one more record, {@code <M>@text!},
     * and comes last; it is shown only when at least one account is. No account at all is {@code
     * 0!} with status 1.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the account list; or, with status -1, the gateway's own message as it stands
     *         (possibly empty), "[GATEWAY]主機連線失敗" or "[BROKER]主機連線失敗"
     * @see #AuthEncode
     */
    public static native String AuthDecode(String reply, int[] status);

    /**
     * Builds the request for the list of all trading accounts (function 12).
     *
     * <p>Fails with a message of the library when the account text is unusable or the device has
     * no address.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #GetTotalAccountDecode
     */
    public static native String GetTotalAccountEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, int[] status);

    /**
     * Reads the reply to an account list request. Same layout as {@link #AuthDecode}, without a
     * notice record.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the account list, {@code 0!} without accounts; or a message with status -1
     * @see #GetTotalAccountEncode
     */
    public static native String GetTotalAccountDecode(String reply, int[] status);

    // ---- account maintenance ---------------------------------------------------------------

    /**
     * Builds the request to open an account (function 9). Branch and password go out empty; the
     * identity is that of the applicant.
     *
     * <p>The library never releases its copies of {@code name}, {@code address} and {@code tel}: a
     * few bytes per call, kept for compatibility.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param extra1 not read; kept for the position
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param extra2 not read; kept for the position
     * @param name name of the applicant
     * @param address postal address
     * @param tel telephone number
     * @param time code of the hour to call back, unsigned, sent as a number
     * @param item code of the kind of account wanted, unsigned, sent as a number
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #OpenAccountDecode
     */
    public static native String OpenAccountEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String extra1,
            String identity, String extra2, String name, String address, String tel, byte time,
            byte item, int[] status);

    /**
     * Reads the reply to an account opening.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the empty text with status 1; or the gateway's message with its source and its code,
     *         {@code [GATEWAY]text(code)}, and status -1
     * @see #OpenAccountEncode
     */
    public static native String OpenAccountDecode(String reply, int[] status);

    /**
     * Builds the request to change the trading password (function 1). Every blank of the request
     * is sent as {@code %20}.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password the password as it is now
     * @param newPassword the password to change to
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #ChangePasswordDecode
     */
    public static native String ChangePasswordEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String newPassword, int[] status);

    /**
     * Reads the reply to a password change.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the empty text with status 1; or {@code [GATEWAY]text(code)} with status -1
     * @see #ChangePasswordEncode
     */
    public static native String ChangePasswordDecode(String reply, int[] status);

    /**
     * Builds the request for the balance of the linked bank account (function 7). Every blank of
     * the request is sent as {@code %20}.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #QueryBankRemainDecode
     */
    public static native String QueryBankRemainEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, int[] status);

    /**
     * Reads the reply to a balance request.
     *
     * <p>The gateway's result code is not examined: a refusal reads as an empty balance with
     * status 1.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return {@code 1!@@@@balance@!}, the balance as the gateway wrote it (tag PN of the first
     *         record); or a transport message with status -1
     * @see #QueryBankRemainEncode
     */
    public static native String QueryBankRemainDecode(String reply, int[] status);

    // ---- certificates ----------------------------------------------------------------------

    /**
     * Builds the request that registers a certificate (function 10).
     *
     * <p>The message may be of any length; every other certificate request must fit 4095 bytes as
     * a whole.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "RegisterCertEncode()傳入的參數錯誤", a device without address that message
     * @see #RegisterCertDecode
     */
    public static native String RegisterCertEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String certMsg,
            int[] status);

    /**
     * Reads the reply to a registration.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String RegisterCertDecode(String reply, int[] status);

    /**
     * Builds the request that fetches a certificate (function 11).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "GetCertEncode()傳入的參數錯誤", a device without address that message
     * @see #GetCertDecode
     */
    public static native String GetCertEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String certMsg,
            int[] status);

    /**
     * Builds the request that fetches a certificate, for longer messages (function 11).
     *
     * <p>The request is that of {@link #GetCertEncode}; this variant also logs its steps.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "GetCertEncode()傳入的參數錯誤", a device without address that message
     * @see #GetCertDecode
     */
    public static native String GetCertEncode2(
            int market, int platform, int seqNo, String serialNo, String localIP, String certMsg,
            int[] status);

    /**
     * Reads the reply to a fetch, of either variant.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String GetCertDecode(String reply, int[] status);

    /**
     * Builds the request that applies for a certificate (function 13).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param birth date of birth of the holder, sent exactly as given
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "ApplyCertEncode()傳入的參數錯誤", a device without address that message
     * @see #ApplyCertDecode
     */
    public static native String ApplyCertEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String birth, String certMsg, int[] status);

    /**
     * Reads the reply to an application.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String ApplyCertDecode(String reply, int[] status);

    /**
     * Builds the request that asks for the state of a certificate (function 14).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "GetCertStatusEncode()傳入的參數錯誤", a device without address that message
     * @see #GetCertStatusDecode
     */
    public static native String GetCertStatusEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String certMsg,
            int[] status);

    /**
     * Reads the reply to a state request.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String GetCertStatusDecode(String reply, int[] status);

    /**
     * Builds the request that renews a certificate (function 15).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param birth date of birth of the holder, sent exactly as given
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "ReNewCertEncode()傳入的參數錯誤", a device without address that message
     * @see #ReNewCertDecode
     */
    public static native String ReNewCertEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String birth, String certMsg, int[] status);

    /**
     * Reads the reply to a renewal.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String ReNewCertDecode(String reply, int[] status);

    /**
     * Builds the request that confirms that a certificate was installed (function 16).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "InstallCertOKEncode()傳入的參數錯誤", a device without address that message
     * @see #InstallCertOKDecode
     */
    public static native String InstallCertOKEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String certMsg,
            int[] status);

    /**
     * Reads the reply to an installation notice.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String InstallCertOKDecode(String reply, int[] status);

    /**
     * Builds the request that confirms that a certificate was opened (function 17).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "OpenCertEncode()傳入的參數錯誤", a device without address that message
     * @see #OpenCertDecode
     */
    public static native String OpenCertEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String certMsg,
            int[] status);

    /**
     * Reads the reply to an opening notice.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String OpenCertDecode(String reply, int[] status);

    /**
     * Builds the request that revokes a certificate (function 18).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param birth date of birth of the holder, sent exactly as given
     * @param certMsg certificate message: opaque text of the certificate software, not empty; sent
     *         as Base64
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send; or, with status -1, a message: an empty certificate message
     *         gives "RevokeCertEncode()傳入的參數錯誤", a device without address that message
     * @see #RevokeCertDecode
     */
    public static native String RevokeCertEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String birth, String certMsg, int[] status);

    /**
     * Reads the reply to a revocation.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the gateway's text (tag M2 of the first record) unchanged, with status 1; or {@code
     *         [CERT]code text}, or a transport message, with status -1
     */
    public static native String RevokeCertDecode(String reply, int[] status);

    // ---- stock orders ----------------------------------------------------------------------

    /**
     * Builds a new stock order. The signature payload is the value of tag 33, its values joined by
     * {@code _}.
     *
     * <p>Refused by the library, in this order: account or address (header), "[CLIENT] 委託種類錯誤"
     * (order kind), "[CLIENT] 委託價格錯誤" (price kind), "[CLIENT] 委託交易錯誤" (trade type), "[CLIENT]
     * 股票代號最多六碼" (code too long), "[CLIENT] 委託數量不可小於0" (quantity 0 or less).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param stockCode stock code, at most 6 characters
     * @param orderDate order date in the Republic of China calendar (YYYMMDD, {@code 1130115});
     *         empty for none
     * @param quantity quantity above 0: lots for trade types 0 and 3 (sent multiplied by {@code
     *         unit}), shares for trade type 2
     * @param unit shares per lot, usually 1000
     * @param price limit price in hundredths of the currency unit ({@code 1005} is 10.05); not
     *         sent for trade type 3 or a price kind other than 0
     * @param side {@code 'B'} to buy, {@code 'S'} to sell; sent unchanged
     * @param flag13 flag that the broker defines, one character, sent unchanged in tag 13
     * @param orderKind order kind, unsigned: 0, 1, 2, 3, 4, 5 or 8 (cash, margin and short-sale
     *         kinds as the broker numbers them)
     * @param priceKind price kind, unsigned: 0 limit price, 1 limit-down price, 5 flat (reference)
     *         price, 9 limit-up price
     * @param tradeType trade type, unsigned: 0 board lots, 2 odd lot, 3 board lots at the
     *         session's fixed price
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6 (the order book
     *         shows an untouched order with 0 as a reservation)
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #SubmitOrderDecode
     */
    public static native String SubmitOrderEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, String orderDate, int quantity,
            int unit, int price, byte side, byte flag13, byte orderKind, byte priceKind,
            byte tradeType, byte n6, int[] status);

    /**
     * Builds a new stock order with the signature payload in a tag PL of its own, its values
     * joined by commas. The order date is not sent in this form.
     *
     * <p>Refused by the library, in this order: account or address (header), "[CLIENT] 委託種類錯誤"
     * (order kind), "[CLIENT] 委託價格錯誤" (price kind), "[CLIENT] 委託交易錯誤" (trade type), "[CLIENT]
     * 股票代號最多六碼" (code too long), "[CLIENT] 委託數量不可小於0" (quantity 0 or less).
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param stockCode stock code, at most 6 characters
     * @param orderDate order date in the Republic of China calendar (YYYMMDD, {@code 1130115});
     *         empty for none
     * @param quantity quantity above 0: lots for trade types 0 and 3 (sent multiplied by {@code
     *         unit}), shares for trade type 2
     * @param unit shares per lot, usually 1000
     * @param price limit price in hundredths of the currency unit ({@code 1005} is 10.05); not
     *         sent for trade type 3 or a price kind other than 0
     * @param side {@code 'B'} to buy, {@code 'S'} to sell; sent unchanged
     * @param flag13 flag that the broker defines, one character, sent unchanged in tag 13
     * @param orderKind order kind, unsigned: 0, 1, 2, 3, 4, 5 or 8 (cash, margin and short-sale
     *         kinds as the broker numbers them)
     * @param priceKind price kind, unsigned: 0 limit price, 1 limit-down price, 5 flat (reference)
     *         price, 9 limit-up price
     * @param tradeType trade type, unsigned: 0 board lots, 2 odd lot, 3 board lots at the
     *         session's fixed price
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6 (the order book
     *         shows an untouched order with 0 as a reservation)
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #SubmitOrderDecode
     */
    public static native String SubmitOrderEncode1(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, String orderDate, int quantity,
            int unit, int price, byte side, byte flag13, byte orderKind, byte priceKind,
            byte tradeType, byte n6, int[] status);

    /**
     * Builds the short order notice: order header without address, then the trade type; no order
     * body, no signature payload.
     *
     * <p>There is no status. When the account text is unusable the result is the message with
     * {@code |28=} and the trade type behind it.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param function order function letter, sent unchanged: {@code 'I'} new, {@code 'D'} cancel,
     *         {@code 'C'} change
     * @param tradeType trade type, unsigned, any value
     * @return the request to send, or the message described above
     * @see #SubmitOrderDecode
     */
    public static native String SubmitOrderEncode2(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, byte function, byte tradeType);

    /**
     * Builds the cancellation of a stock order, with a bare signature payload at its end. No
     * quantity is sent.
     *
     * <p>Refused by the library, in this order: account or address (header), "[CLIENT] 委託種類錯誤"
     * (order kind), "[CLIENT] 委託交易錯誤" (trade type), "[CLIENT] 股票代號最多六碼" (code too long). Quantity
     * and price are not checked.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param stockCode stock code, at most 6 characters
     * @param orderDate date of the order in the Republic of China calendar (YYYMMDD, {@code
     *         1130115}); an empty one is sent as eight zeros
     * @param orderRef the order to act on: its order number and its gateway number joined by
     *         {@code &} (fields 1 and 0 of the order book)
     * @param quantity not sent
     * @param unit not read; 1000 is sent
     * @param price price of the order in hundredths, sent as a plain integer; sent as 0 for trade
     *         type 3
     * @param side {@code 'B'} to buy, {@code 'S'} to sell; sent unchanged
     * @param flag13 flag that the broker defines, one character, sent unchanged in tag 13
     * @param orderKind order kind, unsigned: 0, 1, 2, 3, 4, 5 or 8 (cash, margin and short-sale
     *         kinds as the broker numbers them)
     * @param priceKind not read
     * @param tradeType trade type, unsigned: 0 board lots, 2 odd lot, 3 board lots at the
     *         session's fixed price
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6 (the order book
     *         shows an untouched order with 0 as a reservation)
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #CancelChangeOrderDecode
     */
    public static native String CancelOrderEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, String orderDate, String orderRef,
            int quantity, int unit, int price, byte side, byte flag13, byte orderKind,
            byte priceKind, byte tradeType, byte n6, int[] status);

    /**
     * Builds the cancellation of a stock order with the signature payload in tag PL. Order kinds 6
     * and 7 pass here.
     *
     * <p>Refused by the library, in this order: account or address (header), "[CLIENT] 委託種類錯誤"
     * (order kind), "[CLIENT] 委託交易錯誤" (trade type), "[CLIENT] 股票代號最多六碼" (code too long). Quantity
     * and price are not checked.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param stockCode stock code, at most 6 characters
     * @param orderDate date of the order in the Republic of China calendar (YYYMMDD, {@code
     *         1130115}); an empty one is sent as eight zeros
     * @param orderRef the order to act on: its order number and its gateway number joined by
     *         {@code &} (fields 1 and 0 of the order book)
     * @param quantity quantity: lots for trade types 0 and 3 (sent multiplied by {@code unit}),
     *         shares for trade type 2
     * @param unit shares per lot, usually 1000
     * @param price price of the order in hundredths, sent as a plain integer; sent as 0 for trade
     *         type 3
     * @param side {@code 'B'} to buy, {@code 'S'} to sell; sent unchanged
     * @param flag13 not sent
     * @param orderKind order kind, unsigned: 0 to 8
     * @param priceKind not read
     * @param tradeType trade type, unsigned: 0 board lots, 2 odd lot, 3 board lots at the
     *         session's fixed price
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6 (the order book
     *         shows an untouched order with 0 as a reservation)
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #CancelChangeOrderDecode
     */
    public static native String CancelOrderEncode1(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, String orderDate, String orderRef,
            int quantity, int unit, int price, byte side, byte flag13, byte orderKind,
            byte priceKind, byte tradeType, byte n6, int[] status);

    /**
     * Builds the quantity change of a stock order, with a bare signature payload at its end.
     *
     * <p>Refused by the library, in this order: account or address (header), "[CLIENT] 委託種類錯誤"
     * (order kind), "[CLIENT] 委託交易錯誤" (trade type), "[CLIENT] 股票代號最多六碼" (code too long). Quantity
     * and price are not checked.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param stockCode stock code, at most 6 characters
     * @param orderDate date of the order in the Republic of China calendar (YYYMMDD, {@code
     *         1130115}); an empty one is sent as eight zeros
     * @param orderRef the order to act on: its order number and its gateway number joined by
     *         {@code &} (fields 1 and 0 of the order book)
     * @param quantity quantity: lots for trade types 0 and 3 (sent multiplied by {@code unit}),
     *         shares for trade type 2
     * @param unit shares per lot, usually 1000
     * @param price price of the order in hundredths, sent as a plain integer; sent as 0 for trade
     *         type 3
     * @param side {@code 'B'} to buy, {@code 'S'} to sell; sent unchanged
     * @param flag13 flag that the broker defines, one character, sent unchanged in tag 13
     * @param orderKind order kind, unsigned: 0, 1, 2, 3, 4, 5 or 8 (cash, margin and short-sale
     *         kinds as the broker numbers them)
     * @param priceKind not read
     * @param tradeType trade type, unsigned: 0 board lots, 2 odd lot, 3 board lots at the
     *         session's fixed price
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6 (the order book
     *         shows an untouched order with 0 as a reservation)
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #CancelChangeOrderDecode
     */
    public static native String ChangeOrderEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, String orderDate, String orderRef,
            int quantity, int unit, int price, byte side, byte flag13, byte orderKind,
            byte priceKind, byte tradeType, byte n6, int[] status);

    /**
     * Builds the quantity change of a stock order with the signature payload in tag PL. Order
     * kinds 6 and 7 pass here.
     *
     * <p>Refused by the library, in this order: account or address (header), "[CLIENT] 委託種類錯誤"
     * (order kind), "[CLIENT] 委託交易錯誤" (trade type), "[CLIENT] 股票代號最多六碼" (code too long). Quantity
     * and price are not checked.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param stockCode stock code, at most 6 characters
     * @param orderDate date of the order in the Republic of China calendar (YYYMMDD, {@code
     *         1130115}); an empty one is sent as eight zeros
     * @param orderRef the order to act on: its order number and its gateway number joined by
     *         {@code &} (fields 1 and 0 of the order book)
     * @param quantity quantity: lots for trade types 0 and 3 (sent multiplied by {@code unit}),
     *         shares for trade type 2
     * @param unit shares per lot, usually 1000
     * @param price price of the order in hundredths, sent as a plain integer; sent as 0 for trade
     *         type 3
     * @param side {@code 'B'} to buy, {@code 'S'} to sell; sent unchanged
     * @param flag13 not sent
     * @param orderKind order kind, unsigned: 0 to 8
     * @param priceKind not read
     * @param tradeType trade type, unsigned: 0 board lots, 2 odd lot, 3 board lots at the
     *         session's fixed price
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6 (the order book
     *         shows an untouched order with 0 as a reservation)
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #CancelChangeOrderDecode
     */
    public static native String ChangeOrderEncode1(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, String orderDate, String orderRef,
            int quantity, int unit, int price, byte side, byte flag13, byte orderKind,
            byte priceKind, byte tradeType, byte n6, int[] status);

    /**
     * Reads the acknowledgement of a new stock order.
     *
     * <p>Layout: {@code number@date@@accepted!}: the gateway number (tag 46), the order date (tag
     * 44, Western dates turned into Republic of China dates and the other way round), an empty
     * field, and {@code 0} when the gateway answered {@code X}, else {@code 1}.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the acknowledgement; or, with status -1, the gateway's text (tag K1), a transport
     *         message, or "委託單傳送中!!" for an empty reply
     * @see #SubmitOrderEncode
     */
    public static native String SubmitOrderDecode(String reply, int[] status);

    /**
     * Reads the acknowledgement of a stock cancellation or change.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the empty text with status 1; or, with status -1, a message as in {@link
     *         #SubmitOrderDecode}
     * @see #CancelOrderEncode
     */
    public static native String CancelChangeOrderDecode(String reply, int[] status);

    // ---- stock order book and fills --------------------------------------------------------

    /**
     * Builds the request for the order book of one day (function 2). An empty date gives "[CLIENT]
     * 日期輸入錯誤". Every blank of the request is sent as {@code %20}.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param date day to list, sent exactly as given for both ends of the period; not empty
     * @param tradeType trade type to list, sent as a number in tag 28
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #QueryOrderDecode
     */
    public static native String QueryOrderEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String date, int tradeType, int[] status);

    /**
     * Reads the order book: {@code count!}, then one record per order with 14 fields:
     * <ol start="0">
     * <li>gateway number</li>
     * <li>order number</li>
     * <li>order-type code: 1/2 cash, 3/4 kinds 1 and 3, 5/6 kinds 2 and 4 (odd to buy, even to
     * sell), 7/8 odd lot, 9 to 14 the same at fixed price, 30, 31, 33, 34, 38, 40, 41 the other
     * kinds</li>
     * <li>stock code</li>
     * <li>ordered quantity</li>
     * <li>state text; a failed order reads {@code 委託失敗&text}</li>
     * <li>filled quantity</li>
     * <li>cancelled quantity</li>
     * <li>price in hundredths, or 市價, 平盤價, 漲停價, 跌停價</li>
     * <li>time, six digits</li>
     * <li>date of entry</li>
     * <li>date of the order</li>
     * <li>handling flag N6</li>
     * <li>1 when the order can be changed, 2 when not, else empty</li>
     * </ol>
     *
     * @param market market code: 3 and 103 show a sent order as 委託收到, 8 shows a waiting one as 處理中
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the order book, {@code 0!} without orders; or a message with status -1: {@code
     *         text(code)}, "[CLIENT] 委託種類錯誤" for a kind that has no code, a transport message
     * @see #QueryOrderEncode
     */
    public static native String QueryOrderDecode(int market, String reply, int[] status);

    /**
     * Builds the request for the fills of a period (function 3). An empty date gives "[CLIENT]
     * 日期輸入錯誤". Every blank of the request is sent as {@code %20}.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param startDate first day, Republic of China calendar (sent as a Western date); not empty
     * @param endDate last day, like {@code startDate}
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #QueryReplyDecode
     */
    public static native String QueryReplyEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String startDate, String endDate, int[] status);

    /**
     * Reads the fills: {@code count!}, then one record per fill with 8 fields: order number,
     * order-type code (as in {@link #QueryOrderDecode}), stock code, filled quantity, price in
     * hundredths, amount, date, time.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the fills, {@code 0!} without any; or a message with status -1
     * @see #QueryReplyEncode
     */
    public static native String QueryReplyDecode(String reply, int[] status);

    // ---- stock positions, credit, settlement -----------------------------------------------

    /**
     * Builds the request for the stock positions (function 5). Every blank of the request is sent
     * as {@code %20}.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #QueryInventoryDecode
     * @see #QueryInventoryDecodeJZG
     */
    public static native String QueryInventoryEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, int[] status);

    /**
     * Reads the positions as four sections, each opened by {@code <n>!count!}:
     * <ul>
     * <li>0, cash: {@code code@a|b!}</li>
     * <li>1, margin: {@code code@a|b@@@@@!}</li>
     * <li>2, short sale: {@code code@a|b@@@@!}</li>
     * <li>3, other holdings: {@code code@quantity|0|0!}</li>
     * </ul>
     *
     * <p>A pair is the opening quantity and the day's change; a pair whose sum is 0 is left out.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the four sections, all empty when there is no position; or a message with status -1
     * @see #QueryInventoryEncode
     */
    public static native String QueryInventoryDecode(String reply, int[] status);

    /**
     * Reads the positions in the reply layout of brokerage JZG: three sections (0 to 2, as in
     * {@link #QueryInventoryDecode}) with triples {@code a|b|c} in place of pairs, no section 3.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the three sections; or a message with status -1
     * @see #QueryInventoryEncode
     */
    public static native String QueryInventoryDecodeJZG(String reply, int[] status);

    /**
     * Builds the request for the margin and short-selling figures of one stock (function 8). Every
     * blank of the request is sent as {@code %20}.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param stockCode stock code, not checked
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #QueryCreditInfoDecode
     */
    public static native String QueryCreditInfoEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String stockCode, int[] status);

    /**
     * Reads the credit figures of one stock: one record of 8 fields, stock code and the values of
     * tags 76, 77, B8, B9, A0, A1, A2 as the gateway wrote them.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the record, {@code @@@@@@@!} when there are no figures; or a message with status -1
     * @see #QueryCreditInfoEncode
     */
    public static native String QueryCreditInfoDecode(String reply, int[] status);

    /**
     * Builds the request for the settlement records of a period (function 6). An empty date gives
     * "[CLIENT] 日期輸入錯誤". Every blank of the request is sent as {@code %20}.
     *
     * @param market market code: 0 to 100 asks for securities, above 100 or negative for futures
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param periodOrStart a period selector 1 to 6, or the first day, sent exactly as given
     * @param endDate last day, sent exactly as given; not read with a selector
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #PaymentDecode
     * @see #PaymentDecodeJZG
     */
    public static native String PaymentEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String periodOrStart, String endDate, int[] status);

    /**
     * Reads the settlement: {@code count!}, then one record per trade with 17 fields: date, an
     * empty field, type code, stock code, quantity (47), price in hundredths (48), the values of
     * tags 49, 79, 78 and 84, two values by order kind (81 and 82 for kinds 1 and 3, 85 and 87 for
     * kinds 2 and 4, else {@code 0} and {@code 0}), tags 86, 89 and 88 ({@code 0} when absent),
     * sign ({@code -} or empty) and amount (97).
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the settlement records, {@code 0!} without any; or a message with status -1,
     *         "[CLIENT] 委託種類錯誤" for a kind that has no code
     * @see #PaymentEncode
     */
    public static native String PaymentDecode(String reply, int[] status);

    /**
     * Reads the settlement in the reply layout of brokerage JZG: as {@link #PaymentDecode}, with
     * the text of tag KT as type code; KT also selects fields 10 and 11 (1, 12, 13 like kinds 1
     * and 3; 2, 21, 22 like kinds 2 and 4).
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the settlement records, {@code 0!} without any; or a message with status -1
     * @see #PaymentEncode
     */
    public static native String PaymentDecodeJZG(String reply, int[] status);

    // ---- futures and options orders --------------------------------------------------------

    /**
     * Builds a futures or options order: new, change or cancellation, one leg or two. The
     * signature payload stands bare at the end, its values joined by {@code _}.
     *
     * <p>Each leg text that the order kind needs must be there (commodity and month; strike and
     * call/put for options). When one is missing, or the kind is not 1 to 4, the result is the
     * order header followed by "[CLIENT]傳入的參數錯誤", status -1. Of each character only the low byte
     * is sent.
     *
     * @param market market code of the futures side; the library adds 100, so pass 1 or more (0
     *         would still ask for securities)
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param orderRef for changes and cancellations the order number and the gateway number joined
     *         by {@code &}; not read for a new order
     * @param orderDate date of the order, Republic of China calendar, or empty; sent by {@link
     *         #FutSubmitOrderEncode} only
     * @param commodity1 commodity of leg 1, for example {@code TXF}
     * @param commodity2 commodity of leg 2; empty for one leg
     * @param month1 contract month of leg 1 (YYYYMM)
     * @param month2 contract month of leg 2; empty for one leg
     * @param strike1 strike price of leg 1 as text; empty for futures
     * @param strike2 strike price of leg 2 as text; empty without an option there
     * @param callPut1 {@code C} call, {@code P} put; empty for futures
     * @param callPut2 as {@code callPut1}, for leg 2
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6
     * @param orderKind 1 futures, 2 single option, 3 combination of two options, 4 futures spread
     * @param priceType price type, unsigned: 1 and 3 are market-price types (no price is sent),
     *         any other value a limit price
     * @param function {@code 'I'} new order, {@code 'C'} quantity change, {@code 'A'} price
     *         change, {@code 'D'} (or any other letter) cancellation
     * @param w3 flag W3 of the broker, sent for new orders only; the order book knows blank,
     *         {@code '0'}, {@code '1'}, {@code '2'}
     * @param timeInForce {@code 'I'} immediate or cancel, {@code 'F'} fill or kill, any other
     *         letter rest of day
     * @param reserved1 not read
     * @param side1 {@code 'B'} or {@code 'S'}, leg 1
     * @param side2 {@code 'B'} or {@code 'S'}, leg 2; not sent for one leg
     * @param quantity contracts (lots)
     * @param reserved2 not read
     * @param price limit price with four implied decimals ({@code 180000000} is 18000); negative
     *         prices do not print as one number
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #FutSubmitOrderDecode
     */
    public static native String FutSubmitOrderEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String orderRef, String orderDate, String commodity1,
            String commodity2, String month1, String month2, String strike1, String strike2,
            String callPut1, String callPut2, byte n6, byte orderKind, byte priceType,
            char function, char w3, char timeInForce, char reserved1, char side1, char side2,
            int quantity, int reserved2, int price, int[] status);

    /**
     * Builds a futures or options order as {@link #FutSubmitOrderEncode} does, with the signature
     * payload in tag PL, always in 16 comma-separated places.
     *
     * <p>Each leg text that the order kind needs must be there (commodity and month; strike and
     * call/put for options). When one is missing, or the kind is not 1 to 4, the result is the
     * order header followed by "[CLIENT]傳入的參數錯誤", status -1. Of each character only the low byte
     * is sent.
     *
     * @param market market code of the futures side; the library adds 100, so pass 1 or more (0
     *         would still ask for securities)
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param orderRef for changes and cancellations the order number and the gateway number joined
     *         by {@code &}; not read for a new order
     * @param orderDate date of the order, Republic of China calendar, or empty; sent by {@link
     *         #FutSubmitOrderEncode} only
     * @param commodity1 commodity of leg 1, for example {@code TXF}
     * @param commodity2 commodity of leg 2; empty for one leg
     * @param month1 contract month of leg 1 (YYYYMM)
     * @param month2 contract month of leg 2; empty for one leg
     * @param strike1 strike price of leg 1 as text; empty for futures
     * @param strike2 strike price of leg 2 as text; empty without an option there
     * @param callPut1 {@code C} call, {@code P} put; empty for futures
     * @param callPut2 as {@code callPut1}, for leg 2
     * @param n6 handling flag of the broker, unsigned, sent as a number in tag N6
     * @param orderKind 1 futures, 2 single option, 3 combination of two options, 4 futures spread
     * @param priceType price type, unsigned: 1 and 3 are market-price types (no price is sent),
     *         any other value a limit price
     * @param function {@code 'I'} new order, {@code 'C'} quantity change, {@code 'A'} price
     *         change, {@code 'D'} (or any other letter) cancellation
     * @param w3 flag W3 of the broker, sent for new orders only; the order book knows blank,
     *         {@code '0'}, {@code '1'}, {@code '2'}
     * @param timeInForce {@code 'I'} immediate or cancel, {@code 'F'} fill or kill, any other
     *         letter rest of day
     * @param reserved1 not read
     * @param side1 {@code 'B'} or {@code 'S'}, leg 1
     * @param side2 {@code 'B'} or {@code 'S'}, leg 2; not sent for one leg
     * @param quantity contracts (lots)
     * @param reserved2 not read
     * @param price limit price with four implied decimals ({@code 180000000} is 18000); negative
     *         prices do not print as one number
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #FutSubmitOrderDecode
     */
    public static native String FutSubmitOrderEncode1(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String orderRef, String orderDate, String commodity1,
            String commodity2, String month1, String month2, String strike1, String strike2,
            String callPut1, String callPut2, byte n6, byte orderKind, byte priceType,
            char function, char w3, char timeInForce, char reserved1, char side1, char side2,
            int quantity, int reserved2, int price, int[] status);

    /**
     * Reads the acknowledgement of a futures order.
     *
     * <p>Layout: {@code number@date@@accepted@mt@!}: gateway number, order date, an empty field,
     * {@code 0} when the gateway answered {@code X}, else {@code 1}, and the gateway's MT flag
     * ({@code 0}, {@code 1} or empty).
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the acknowledgement; "委託單傳送中!!" with status 1 for an empty reply; or, with status
     *         -1, the gateway's text (tag K1) or a transport message
     * @see #FutSubmitOrderEncode
     */
    public static native String FutSubmitOrderDecode(String reply, int[] status);

    // ---- futures and options lists ---------------------------------------------------------

    /**
     * Builds the request for the futures order book of one day (function x, 0). Every blank of the
     * request is sent as {@code %20}.
     *
     * @param market market code of the futures side; the library adds 100, so pass 1 or more (0
     *         would still ask for securities)
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param date day to list, Republic of China calendar (sent as a Western date); an empty one
     *         gives "[CLIENT]日期輸入錯誤"
     * @param orderType order type to list, sent as a number in tag 28
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #FutQueryOrderDecode
     */
    public static native String FutQueryOrderEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String date, int orderType, int[] status);

    /**
     * Reads the futures order book: {@code count!}, then one record per order with 16 fields:
     * <ol start="0">
     * <li>gateway number</li>
     * <li>order number</li>
     * <li>leg codes: 51 to 58, two joined by {@code |} for two legs (odd buys, even sells)</li>
     * <li>contract: {@code TIMEX&letter&commodity&month&call/put&strike}; letter F futures, O
     * option, X option combination, Y futures spread; strikes with four implied decimals</li>
     * <li>ordered quantity</li>
     * <li>state text, with {@code &text} when there is a message</li>
     * <li>filled quantity</li>
     * <li>cancelled quantity</li>
     * <li>price with four implied decimals, 市價 or 範圍市價; left out when the gateway names no price
     * type</li>
     * <li>time, six digits</li>
     * <li>date of entry</li>
     * <li>date of the order</li>
     * <li>handling flag N6</li>
     * <li>1 when the order can be changed, 2 when not, else empty</li>
     * <li>time in force: R, I or F</li>
     * <li>MT flag</li>
     * </ol>
     *
     * <p>This decoder does not log its result and does not look for transport markers: a bare one
     * reads as an empty result with status -1.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the order book, {@code 0!} without orders; or, with status -1, {@code text(code)},
     *         "[CLIENT]委託種類錯誤" (unknown call/put) or "[CLIENT]主機連線失敗" (empty reply)
     * @see #FutQueryOrderEncode
     */
    public static native String FutQueryOrderDecode(String reply, int[] status);

    /**
     * Builds the request for the futures fills of a period (function x, 1). Any empty text gives
     * "[CLIENT]傳入的參數錯誤", a date that reads as 0 "[CLIENT]起訖日期錯誤". Every blank of the request is
     * sent as {@code %20}.
     *
     * @param market market code of the futures side; the library adds 100, so pass 1 or more (0
     *         would still ask for securities)
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage, not empty
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}, not empty
     * @param password trading password, not empty
     * @param startDate first day, Republic of China calendar (sent as a Western date)
     * @param endDate last day, like {@code startDate}
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #FutQueryReplyDecode
     */
    public static native String FutQueryReplyEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, String startDate, String endDate, int[] status);

    /**
     * Reads the futures fills: {@code count!}, then one record per fill with 10 fields: order
     * number {@code &} gateway number; leg codes; contract ({@code
     * TAIMEX&letter&commodity&month&call/put&strike}); remaining {@code &} filled quantity; price
     * {@code &} fill price, four implied decimals; two empty fields; order time {@code &} fill
     * time; MT flag; order date {@code &} fill date.
     *
     * <p>Transport markers are not looked for here: a bare one reads as {@code ()} with status -1.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the fills, {@code 0!} without any; or, with status -1, {@code text(code)} or
     *         "[CLIENT]主機連線失敗" (empty reply)
     * @see #FutQueryReplyEncode
     */
    public static native String FutQueryReplyDecode(String reply, int[] status);

    /**
     * Builds the request for the open futures and options positions (function O). Any empty text
     * gives "傳入的參數錯誤".
     *
     * @param market market code of the futures side; the library adds 100, so pass 1 or more (0
     *         would still ask for securities)
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage, not empty
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}, not empty
     * @param password trading password, not empty
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #FutQueryInventoryDecode
     */
    public static native String FutQueryInventoryEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, int[] status);

    /**
     * Reads the open positions as two sections, {@code <5>!count!} futures and {@code <6>!count!}
     * options.
     * <ul>
     * <li>futures: {@code side@TIMEX&F&commodity&month@quantity@price@date@currency!}; a spread
     * shows letter Y and pairs joined by {@code |}</li>
     * <li>options: {@code side@TIMEX&O&commodity&month&call/put&strike@quantity@price@date!}; a
     * combination shows letter X and pairs</li>
     * </ul>
     *
     * <p>Months carry {@code 00} behind them; prices and strikes have four implied decimals; the
     * currency is TWD, USD, RMB or empty. Transport markers are not looked for here.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the two sections; or, with status -1, {@code text(code)} or "[CLIENT]主機連線失敗" (empty
     *         reply)
     * @see #FutQueryInventoryEncode
     */
    public static native String FutQueryInventoryDecode(String reply, int[] status);

    /**
     * Builds the request for the margin account (function P). Every blank of the request is sent
     * as {@code %20}.
     *
     * @param market market code of the futures side; the library adds 100, so pass 1 or more (0
     *         would still ask for securities)
     * @param platform row of the client edition, 0 to 14; any other row is sent as "NO DEFINE"
     * @param seqNo request number; its last two decimal digits go into the request id (-1 counts
     *         as 95)
     * @param serialNo serial number of the device, at most 20 characters (a longer one is cut)
     * @param localIP address of the device in text form, at most 64 characters; empty when the
     *         device has none
     * @param branch branch code of the brokerage
     * @param identity ID number and account in one text, joined by {@code &}, see {@link
     *         gatewayjni}
     * @param password trading password
     * @param queryType kind of margin account: 0 is sent as 3, 3 and 4 as 5, any other value
     *         unchanged
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the request to send, or the message to show when {@code status[0]} is -1
     * @see #QueryFinanceDecode
     */
    public static native String QueryFinanceEncode(
            int market, int platform, int seqNo, String serialNo, String localIP, String branch,
            String identity, String password, int queryType, int[] status);

    /**
     * Reads the margin account: {@code 1!TWD@} and 30 fields that each end in {@code @}, then
     * {@code !}. Amounts have four implied decimals unless stated: field 2 LO with two decimals, 4
     * PN, 5 RA, 6 LO, 7 QY, 9 QX, 11 and 17 U5, 16 U9, 22 RF, 27 to 30 F0 to F3; the others are
     * empty.
     *
     * <p>The gateway's result code is not examined, nor are transport markers: such a reply shows
     * zeros with status 1.
     *
     * @param reply the gateway's reply, exactly as received
     * @param status at least one element; element 0 receives 1 for success, -1 for failure
     * @return the margin record; or "[CLIENT]主機連線失敗" with status -1 (empty reply)
     * @see #QueryFinanceEncode
     */
    public static native String QueryFinanceDecode(String reply, int[] status);
}
