package com.brindlex.kernel.quorvane.bench;

/**
 * The stock order book as an app would decode it in Java. How a field is found is left to the
 * subclasses; what a record shows is the same for all.
 */
abstract class StockBook {
    private static final int END_MARK = 900000;

    /** The fields of one record; an absent one is an empty text. */
    interface Fields {
        String get(String tag);
    }

    /** Makes the fields of the text of one record. */
    abstract Fields index(String record);

    /** Decodes a reply that is a list. */
    final String decode(String reply) {
        StringBuilder out = new StringBuilder();
        int count = 0;
        int begin = reply.indexOf("|00=");
        while (begin >= 0) {
            int end = reply.indexOf("|01=", begin);
            if (end < 0) {
                break;
            }
            Fields fields = index(reply.substring(begin, end));
            if (number(fields.get("67")) >= END_MARK) {
                break;
            }
            if (fields.get("68").equals("0000")) {
                appendOrder(fields, out);
                count++;
            }
            begin = reply.indexOf("|00=", end);
        }
        return count + "!" + out;
    }

    private static void appendOrder(Fields fields, StringBuilder out) {
        int ordered = number(fields.get("70"));
        int reduced = number(fields.get("41")) + number(fields.get("37"));
        int filled = number(fields.get("47"));
        boolean failed = fields.get("39").equals("E");
        String remark = fields.get("K1");
        String failure = failed ? remark.replace('!', ' ') : "";
        boolean buying = fields.get("32").equals("B");

        out.append(fields.get("46")).append('@').append(fields.get("36")).append('@');
        out.append(typeCode(number(fields.get("27")), number(fields.get("28")), buying));
        out.append('@').append(fields.get("29")).append('@').append(ordered).append('@');
        if (!failed) {
            out.append(state(fields, remark, ordered, reduced, filled));
        } else if (!failure.isEmpty()) {
            out.append("委託失敗&").append(failure);
        }
        out.append('@').append(filled).append('@').append(reduced).append('@');
        out.append(price(fields.get("31"), number(fields.get("M8")))).append('@');
        String time = fields.get("22");
        out.append(time, 0, Math.min(6, time.length()));
        out.append('@').append(date(fields.get("21"))).append('@').append(date(fields.get("44")));
        out.append('@').append(fields.get("N6")).append('@');
        String flag = fields.get("JV");
        if (flag.equals("Y")) {
            out.append('1');
        } else if (flag.equals("N") || !failure.isEmpty()) {
            out.append('2');
        }
        out.append('!');
    }

    private static String state(
            Fields fields, String remark, int ordered, int reduced, int filled) {
        if (remark.equals("全部取消")) {
            return "已取消";
        } else if (remark.equals("委託已傳送，等待接收回報！")) {
            return "正在處理";
        } else if (reduced == ordered) {
            return "已取消";
        } else if (filled != 0 && ordered == filled) {
            return "已成交";
        } else if (filled != 0) {
            return ordered == reduced + filled ? "部份成交，其餘已取消" : "部份成交";
        } else if (reduced == 0) {
            return fields.get("N6").equals("0") ? "預約單" : "委託成功";
        }
        return "已改量";
    }

    private static int typeCode(int kind, int type, boolean buying) {
        int code = kind == 0 ? 1 : kind % 2 == 1 ? 3 : 5;
        if (type == 2) {
            code = 7;
        } else if (type == 3) {
            code += 8;
        }
        return buying ? code : code + 1;
    }

    private static String price(String text, int kind) {
        switch (kind) {
            case 1:
                return "跌停價";
            case 5:
                return "平盤價";
            case 9:
                return "漲停價";
            default:
                int point = text.indexOf('.');
                int value = point < 0
                        ? number(text) * 100
                        : number(text.substring(0, point)) * 100
                                + number(text.substring(point + 1, point + 3));
                return value == 0 ? "市價" : Integer.toString(value);
        }
    }

    /** From the Republic of China calendar to the western one. */
    private static String date(String text) {
        if (text.length() != 7) {
            return text;
        }
        return (Integer.parseInt(text.substring(0, 3)) + 1911) + text.substring(3);
    }

    private static int number(String text) {
        return text.isEmpty() ? 0 : Integer.parseInt(text);
    }
}
