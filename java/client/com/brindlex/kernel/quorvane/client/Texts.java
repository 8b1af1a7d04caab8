package com.brindlex.kernel.quorvane.client;

import org.jetbrains.annotations.Nullable;

/** What may stand in a text of a request. */
final class Texts {
    private Texts() {}

    /** What in a text would not arrive as it is; null when all does. */
    @Nullable
    static String foreign(String text) {
        for (int i = 0; i < text.length(); i++) {
            char letter = text.charAt(i);
            if (letter == '|') {
                return "must not contain '|', which ends a field";
            }
            if (letter < ' ' || letter == 0x7F) {
                return "must not contain control characters";
            }
            if (Character.isHighSurrogate(letter) && i + 1 < text.length()
                    && Character.isLowSurrogate(text.charAt(i + 1))) {
                i++;
            } else if (Character.isSurrogate(letter)) {
                return "must not contain half a character";
            }
        }
        return text.contains("%20") ? "must not contain '%20', which reads as a blank" : null;
    }

    /** Bytes of a text as it is handed to the library, which writes rare characters in six. */
    static int utf8Length(String text) {
        int length = 0;
        for (int i = 0; i < text.length(); i++) {
            char letter = text.charAt(i);
            length += letter < 0x80 ? 1 : letter < 0x800 ? 2 : 3;
        }
        return length;
    }
}
