package com.brindlex.kernel.quorvane.console.message;

/**
 * Something wrong in a message.
 *
 * @param offset characters of the message before it
 * @param kind its name, the same in every version: {@code impossible-date}
 * @param text what is wrong there, in words
 */
public record Fault(int offset, String kind, String text) {}
