package com.brindlex.kernel.quorvane.console.message;

import static org.junit.jupiter.api.Assertions.assertEquals;
import static org.junit.jupiter.api.Assertions.assertTrue;

import java.util.HashSet;
import java.util.List;
import java.util.Map;
import java.util.Set;
import java.util.TreeMap;
import org.junit.jupiter.api.Test;

/** Each damage is found, alone, at its place, and has a name of its own. */
public class DamagedMessagesTest {
    private static final String HEAD = "F=1|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE|VER=24369"
            + "|SN=SN0001|65=0013452107|14=I|15=0|IDNO=A123456789|ACNO=1234567|PWD=pw"
            + "|21=20240115|22=134521|23=13452107|24=5|V4=";
    private static final String ORDER = HEAD + "|44=20240115|27=0|28=0|29=2330|30=2000|UT=1000|13=7"
            + "|N6=1|31=10.05|M8=0|32=B|33=!!9A00_1234567_A123456789_I_B_2330_2000_10.05";
    private static final String TAGGED = HEAD + "|27=0|28=0|29=2330|30=2000|UT=1000|13=7|N6=1"
            + "|31=10.05|M8=0|32=B|33=|PL=S!!SN0001,10.0.0.1,20240115,9A00-1234567,A123456789,I,B,"
            + "2330,0,0,0,2000,10.05,";
    private static final String FUTURES = HEAD.replace("KIND=S", "KIND=F") + "|27=2|28=0|29=202401"
            + "|30=3|31=17500.0000|M8=|32=B|33=TXF|34=|O4=0|V5=1|V6=|V8=|W3=0|N6=0"
            + "!!9A00_1234567_A123456789_I_I_B_TXF_202401___3_17500.0000";
    private static final String SPREAD = HEAD.replace("KIND=S", "KIND=F") + "|27=2|28=0|29=202401"
            + "|30=3|31=25.0000|M8=|32=B|33=TXF|34=|O4=0|V5=0|V6=7|V8=|EL=S|V9=TXF|W0=202402|W1="
            + "|W2=|EM=3|W3=0|N6=0"
            + "!!9A00_1234567_A123456789_I_R_B_TXF_202401___S_TXF_202402___3_25.0000";
    private static final String LOGIN = "F=7|KIND=S|BHNO=9A00|CB=1|IP=10.0.0.1|11=NO DEFINE"
            + "|VER=24369|65=0013452107|SN=SN0001|15=1|IDNO=A123456789|ACNO=1234567|PWD=pw"
            + "|FUNC=0|01=";
    private static final String APPLY = LOGIN.replace("FUNC=0|", "FUNC=13|MSG=YWJj|BIRTH=19800229|");
    private static final String FILLS = LOGIN.replace("|FUNC=0|",
            "||FUNC=3|57=2|SDATE=20240115|EDATE=20240116|");
    private static final String RECORD = "|00=1|67=1|68=0000|46=G0002|36=W0001|27=0|28=0|32=B"
            + "|29=2330|70=5000|41=0|37=0|47=0|39= |K1=|N6=1|31=10.05|M8=0|22=134521|21=20240115"
            + "|44=20240115|JV=Y|01=";
    private static final String END = "|00=2|67=900000|68=0000|01=";
    private static final String BOOK = RECORD + END;
    private static final String RECEIPT = "F=1|39= |19=S|46=G0002|44=20240115";
    private static final String ACCOUNTS = "2!<S>@a@1234567@9A00@1!<F>@b@7654321@F001@1!";
    private static final String POSITIONS = "<5>!0!<6>!0!";

    /** A damage: its kind, the sound message, what is replaced, and by what. */
    private record Damage(String kind, String sound, String from, String to) {
        String damaged() {
            int at = sound.indexOf(from);
            assertTrue(at >= 0, this::toString);
            return sound.substring(0, at) + to + sound.substring(at + from.length());
        }

        int place() {
            return sound.indexOf(from);
        }
    }

    private static final List<Damage> DAMAGES = List.of(
            new Damage("missing-field", ORDER, "|29=2330", ""),
            new Damage("cut-short", APPLY, "|BIRTH=19800229|01=", ""),
            new Damage("missing-bar", FILLS, "||FUNC", "|FUNC"),
            new Damage("doubled-bar", LOGIN, "|VER", "||VER"),
            new Damage("no-signature", ORDER, "!!9A00_1234567_A123456789_I_B_2330_2000_10.05", ""),
            new Damage("unexpected-signature", LOGIN, "|01=", "|01=!!9A00_1"),
            new Damage("no-tag", LOGIN, "|CB=1|", "|CB=1|what|"),
            new Damage("misplaced-field", ORDER, "|27=0|28=0|29=2330", "|28=0|29=2330|27=0"),
            new Damage("repeated-field", ORDER, "|13=7", "|13=7|13=7"),
            new Damage("unexpected-field", TAGGED, "|27=0", "|44=20240115|27=0"),
            new Damage("unknown-tag", LOGIN, "|CB=1", "|CB=1|QX=1"),
            new Damage("not-empty", FUTURES, "|M8=|", "|M8=1|"),
            new Damage("wrong-constant", LOGIN, "VER=24369", "VER=24368"),
            new Damage("contradiction", ORDER, "|23=13452107", "|23=13452108"),
            new Damage("signature-places", ORDER, "_B_2330_2000_10.05", "_B_2330_10.05"),
            new Damage("signature-mismatch", ORDER, "_B_2330_2000", "_B_2317_2000"),
            new Damage("impossible-time", ORDER, "|22=134521", "|22=256199"),
            new Damage("missing-value", LOGIN, "PWD=pw", "PWD="),
            new Damage("not-one-character", ORDER, "|13=7", "|13=77"),
            new Damage("too-long", LOGIN, "SN=SN0001", "SN=SN0001SN0001SN0001SN0001"),
            new Damage("impossible-date", APPLY, "BIRTH=19800229", "BIRTH=19810229"),
            new Damage("impossible-month", SPREAD.replace("202402", "202413"), "~", "~"),
            new Damage("not-a-price", ORDER.replace("10.05", "-1.-50"), "~", "~"),
            new Damage("not-a-number", ORDER, "|UT=1000", "|UT=k"),
            new Damage("out-of-range", ORDER, "|N6=1", "|N6=256"),
            new Damage("unknown-code", ORDER, "|27=0", "|27=6"),
            new Damage("not-an-account", LOGIN, "ACNO=1234567", "ACNO=-123456"),
            new Damage("wrong-length", LOGIN, "IDNO=A123456789", "IDNO=A12345"),
            new Damage("not-base64", APPLY, "MSG=YWJj", "MSG=YWJ"),
            new Damage("wrong-market", FUTURES, "KIND=F", "KIND=S"),
            new Damage("not-whole-lots", ORDER.replace("2000", "2001"), "~", "~"),
            new Damage("no-result-code", BOOK, "|68=0000", ""),
            new Damage("record-not-closed", BOOK, "|01=" + END, "|"),
            new Damage("record-not-opened", BOOK, "|01=" + END, "|01=|01=" + END),
            new Damage("no-end-mark", BOOK, END, ""),
            new Damage("after-end-mark", BOOK, END, END + RECORD),
            new Damage("record-too-long", BOOK.replace("|K1=|", "|K1=" + "長".repeat(66) + "|")
                    .replace("W0001", "W".repeat(49)).replace("G0002", "G".repeat(49)), "~", "~"),
            new Damage("wrong-count", ACCOUNTS, "2!", "3!"),
            new Damage("wrong-places", ACCOUNTS, "@b@7654321", "@b@c@7654321"),
            new Damage("unknown-section", POSITIONS, "<6>", "<7>"));

    private static final List<String> DECODERS_OF_BOOK = List.of("QueryOrderDecode");

    /** Every damaged message by the kind of its fault. */
    public static Map<String, String> all() {
        Map<String, String> all = new TreeMap<>();
        DAMAGES.forEach(each -> all.put(each.kind(),
                each.from().equals("~") ? each.sound() : each.damaged()));
        return all;
    }

    private static Message read(String text) {
        return MessageReader.read(text,
                text.contains("|00=1") ? DECODERS_OF_BOOK
                : text.startsWith("<5>") ? List.of("FutQueryInventoryDecode")
                : text.startsWith("2!") || text.startsWith("3!") ? List.of("AuthDecode")
                                                                 : List.of());
    }

    @Test
    void soundMessagesHaveNoFault() {
        for (String sound : List.of(ORDER, TAGGED, FUTURES, SPREAD, LOGIN, APPLY, FILLS, BOOK,
                RECEIPT, ACCOUNTS, POSITIONS)) {
            assertEquals(List.of(), read(sound).faults(), sound);
        }
    }

    /** The mark of a signature payload may stand in a password, too. */
    @Test
    void aPasswordMayHoldTheMarkOfThePayload() {
        for (String sound : List.of(ORDER, TAGGED, FUTURES, LOGIN)) {
            String typed = sound.replace("PWD=pw", "PWD=p!!w");
            assertEquals(List.of(), read(typed).faults(), typed);
        }
    }

    @Test
    void everyDamageIsNamedAndNothingElse() {
        Set<String> kinds = new HashSet<>();
        for (Damage damage : DAMAGES) {
            String text = damage.from().equals("~") ? damage.sound() : damage.damaged();
            List<Fault> faults = read(text).faults();
            assertEquals(List.of(damage.kind()), faults.stream().map(Fault::kind).toList(),
                    () -> text + "\n" + faults);
            Fault fault = faults.get(0);
            assertTrue(fault.offset() >= 0 && fault.offset() <= text.length(), fault::toString);
            assertTrue(kinds.add(damage.kind()), () -> damage.kind() + " twice");
        }
        assertTrue(kinds.size() >= 30, () -> kinds.size() + " kinds");
    }

    @Test
    void theFaultStandsWhereTheDamageIs() {
        for (Damage damage : DAMAGES) {
            if (damage.from().equals("~") || damage.sound().equals(BOOK)
                    || damage.kind().startsWith("signature") || damage.kind().startsWith("wrong-c")) {
                continue;
            }
            int offset = read(damage.damaged()).faults().get(0).offset();
            int far = damage.from().length() + damage.to().length() + 2;
            assertTrue(Math.abs(offset - damage.place()) <= far, damage.kind() + " at " + offset
                    + ", not near " + damage.place());
        }
    }

    /** A signature that names another stock, quantity, price, side, account, branch or function. */
    @Test
    void everyPlaceOfASignatureIsHeldAgainstTheBody() {
        String payload = ORDER.substring(ORDER.indexOf("!!") + 2);
        String[] places = payload.split("_");
        for (int i = 0; i < places.length; i++) {
            String[] forged = places.clone();
            forged[i] = "X";
            assertForged(ORDER.replace(payload, String.join("_", forged)), i);
        }
        String tagged = TAGGED.substring(TAGGED.indexOf("!!") + 2);
        String[] more = tagged.split(",");
        for (int i = 0; i < more.length; i++) {
            if (i == 10) {
                continue;  // the price kind that M8 writes as a fixed 0
            }
            String[] forged = more.clone();
            forged[i] = "X";
            assertForged(TAGGED.replace(tagged, String.join(",", forged) + ","), i);
        }
    }

    private static void assertForged(String text, int place) {
        List<Fault> faults = read(text).faults();
        assertTrue(faults.stream().anyMatch(fault -> fault.kind().equals("signature-mismatch")),
                () -> "place " + place + ": " + text + "\n" + faults);
    }

    /** Nothing that a log may hold breaks the reading, however bad. */
    @Test
    void everyPieceOfAMessageCanBeRead() {
        for (String sound : List.of(ORDER, TAGGED, SPREAD, LOGIN, BOOK, ACCOUNTS)) {
            for (int cut = 0; cut <= sound.length(); cut += 3) {
                for (String text : List.of(sound.substring(0, cut), sound.substring(cut),
                        sound.substring(0, cut) + "\u0000|=!!@" + sound.substring(cut))) {
                    for (Fault fault : MessageReader.read(text).faults()) {
                        assertTrue(fault.offset() <= text.length(), () -> fault + "\n" + text);
                    }
                }
            }
        }
    }
}
