package com.brindlex.kernel.quorvane.console.timeline;

import com.brindlex.kernel.quorvane.console.log.LogMessage;
import com.brindlex.kernel.quorvane.console.message.Message;

/**
 * A row of a timeline with what it was made of.
 *
 * @param row the row
 * @param source the message as the log has it
 * @param message what it says, without its fields: {@code MessageReader.read} brings them
 */
public record Event(Row row, LogMessage source, Message message) {}
