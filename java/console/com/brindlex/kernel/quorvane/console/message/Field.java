package com.brindlex.kernel.quorvane.console.message;

/**
 * One field of a message.
 *
 * @param offset characters of the message before it
 * @param tag its tag, or its place in a result
 * @param value as it stands
 * @param name what it is; null when nobody knows
 * @param meaning the value for people; empty when it says no more than the value
 */
public record Field(int offset, String tag, String value, String name, String meaning) {}
