package com.brindlex.kernel.quorvane.simulator;

import java.time.Clock;
import java.time.Duration;
import java.time.LocalDateTime;
import java.time.ZoneId;

/** Requests written by hand, all of one device at one moment. */
final class Wire {
    static final Clock CLOCK = Clock.fixed(
            LocalDateTime.of(2024, 1, 15, 13, 45, 21).atZone(ZoneId.of("Asia/Taipei")).toInstant(),
            ZoneId.of("Asia/Taipei"));

    /** Header of a query that names ID number and account; the platform name holds a blank. */
    static final String QUERY =
            "F=7|KIND=S|BHNO=9A01|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107"
            + "|SN=DEV1|15=1|IDNO=A123456789|ACNO=1234567|PWD=pass1234|";

    /** The same with its blanks escaped. */
    static final String ESCAPED = QUERY.replace(" ", "%20");

    /** Header of a query that names nobody. */
    static final String ANONYMOUS =
            "F=7|KIND=S|BHNO=|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|65=0013452107|SN=DEV1|";

    static final String FUTURES = ESCAPED.replace("KIND=S", "KIND=F").replace("9A01", "F001")
            .replace("1234567|", "7654321|");

    private static final String STAMP = "|21=20240115|22=134521|23=13452107|24=5|V4=";

    /** Payload prefix of the family that joins by commas. */
    static final String KEY_1 = "DEV1,10.0.0.1,20240115,";

    private Wire() {}

    /** The ready-made world at that moment, by a gateway that looks at the clock of the device. */
    static GatewayBuilder gateway() {
        return Gateway.readyMade().clock(CLOCK).tolerance(Duration.ofMinutes(10));
    }

    /** Plain order header of the securities account. */
    static String order(char function) {
        return "F=1|KIND=S|BHNO=9A01|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369|SN=DEV1|65=0013452107|14="
                + function + "|15=0|IDNO=A123456789|ACNO=1234567|PWD=pass1234" + STAMP
                + "|44=20240115";
    }

    /** Order header of the family with tag PL. */
    static String order1(char function) {
        return order(function).replace("|44=20240115", "");
    }

    static String futures(char function) {
        return onFuturesAccount(order(function));
    }

    static String futures1(char function) {
        return onFuturesAccount(order1(function));
    }

    private static String onFuturesAccount(String header) {
        return header.replace("KIND=S", "KIND=F")
                .replace("9A01", "F001")
                .replace("1234567|", "7654321|");
    }

    static String buyTwoLots() {
        return order('I') + "|27=0|28=0|29=2330|30=2000|UT=1000|13=0|N6=1|31=995.00|M8=0|32=B"
                + "|33=!!9A01_1234567_A123456789_I_B_2330_2000_995.00";
    }

    static String buyTwoLots1() {
        return order1('I') + "|27=0|28=0|29=2330|30=2000|UT=1000|13=0|N6=1|31=995.00|M8=0|32=B|33="
                + "|PL=S!!" + KEY_1 + "9A01-1234567,A123456789,I,B,2330,0,0,0,2000,995.00,";
    }

    static String cancel() {
        return order('D')
                + "|10=20240115|36=A0001|46=0000000001|28=0|29=2330|31=99500|32=B|N6=1|27=0|UT=1000|13=0"
                + "!!9A01_1234567_A123456789_D_A0001_B_2330__";
    }

    static String cancel1() {
        return order1('D')
                + "|10=20240115|36=A0001|46=0000000001|28=0|29=2330|31=99500|32=B|37=2000|N6=1|27=0|UT=1000"
                + "|PL=S!!" + KEY_1 + "9A01-1234567,A123456789,D,B,2330,,0,,,,A0001";
    }

    static String change() {
        return order('C')
                + "|10=20240115|36=A0001|46=0000000001|28=0|29=2330|31=99500|32=B|37=1000|N6=1|27=0|UT=1000"
                + "|13=0!!9A01_1234567_A123456789_C_A0001_B_2330_1000_";
    }

    static String change1() {
        return order1('C')
                + "|10=20240115|36=A0001|46=0000000001|28=0|29=2330|31=99500|32=B|37=1000|N6=1|27=0|UT=1000"
                + "|PL=S!!" + KEY_1 + "9A01-1234567,A123456789,C,B,2330,,0,,1000,,A0001";
    }

    static String buyFutures() {
        return futures('I')
                + "|27=2|28=0|29=202402|30=2|31=18000.0000|M8=|32=B|33=TXF|34=|O4=0|V5=0|V6=|V8=|W3=0|N6=1"
                + "!!F001_7654321_A123456789_I_R_B_TXF_202402___2_18000.0000";
    }

    static String buyFutures1() {
        return futures1('I')
                + "|27=2|28=0|29=202402|30=2|31=18000.0000|M8=|32=B|33=TXF|34=|O4=0|V5=0|V6=|V8=|W3=0|N6=1"
                + "|PL=S!!" + KEY_1
                + "F001-7654321,A123456789,I,R,0,2,B,TXF,202402,,,,,,,,2,18000.0000,";
    }

    static String buyCallSpread() {
        return futures('I')
                + "|27=1|28=0|29=202402|30=1|31=00000000.000000|M8=|32=B|33=TXO|34=18000|O4=0|V5=1|V6=1|V8=C"
                + "|EL=S|V9=TXO|W0=202402|W1=C|W2=18500|EM=1|W3=0|N6=1"
                + "!!F001_7654321_A123456789_I_I_B_TXO_202402_18000_C_S_TXO_202402_18500_C_1_00000000.000000";
    }

    static String buyCallSpread1() {
        return futures1('I')
                + "|27=1|28=0|29=202402|30=1|31=00000000.000000|M8=|32=B|33=TXO|34=18000|O4=0|V5=1|V6=1|V8=C"
                + "|EL=S|V9=TXO|W0=202402|W1=C|W2=18500|EM=1|W3=0|N6=1|PL=S!!" + KEY_1
                + "F001-7654321,A123456789,I,I,0,1,B,TXO,202402,18000,C,S,TXO,202402,18500,C,1,00000000.000000,";
    }

    /** Change of the futures order by the plain family. */
    static String changeFutures(char function) {
        return futures(function)
                + "|27=2|28=0|29=202402|30=1|31=18010.0000|M8=|32=B|33=TXF|34=|O4=0|V5=0|V6=|V8="
                + "|36=F0001|46=0005000001|37=1|N6=1!!F001_7654321_A123456789_" + function
                + "_F0001" + (function == 'C' ? "_1" : "");
    }

    /** Change of the futures order by the family with tag PL. */
    static String changeFutures1(char function) {
        String payload = function == 'A' ? "R,,,,,,,,,,,,,1,18010.0000,F0001"
                : ",,,,,,,,,,,,," + (function == 'C' ? "1" : "0") + ",,F0001";
        return futures1(function)
                + "|27=2|28=0|29=202402|30=1|31=18010.0000|M8=|32=B|33=TXF|34=|O4=0|V5=0|V6=|V8="
                + "|36=F0001|46=0005000001|37=1|N6=1|PL=S!!" + KEY_1 + "F001-7654321,A123456789,"
                + function + "," + payload;
    }
}
