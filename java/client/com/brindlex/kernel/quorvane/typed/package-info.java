/**
 * Requests with named setters and results with named columns, beside the natives of {@link
 * com.brindlex.kernel.quorvane.gatewayjni}.
 *
 * <p>{@link com.brindlex.kernel.quorvane.typed.Requests} opens a request; its {@code encode()}
 * gives the text to send. {@link com.brindlex.kernel.quorvane.typed.Operation#decode} reads a reply
 * into a {@link com.brindlex.kernel.quorvane.typed.Result}: rows whose columns stand in the table
 * classes, for example {@link com.brindlex.kernel.quorvane.typed.StockOrders}.
 *
 * <p>No text that a decoder returns makes anything here throw. Codes that nobody knows stay
 * readable as they came; values that cannot be read are {@code null} beside their text.
 *
 * <p>Java 8 language and Android API 21; no dependency.
 */
package com.brindlex.kernel.quorvane.typed;
