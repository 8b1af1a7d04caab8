/**
 * Requests and replies by name and type: what an app talks to.
 *
 * <p>{@link com.brindlex.kernel.quorvane.client.Requests} builds a {@link
 * com.brindlex.kernel.quorvane.client.Request}, or refuses with every fault told before a native is
 * called. A request has the text to send and reads the reply to it as a {@link
 * com.brindlex.kernel.quorvane.client.Reply}: a result, a failure, or an order that is on its way.
 *
 * <p>Nothing here keeps a connection, a file or a thread. Values, requests, replies and rows never
 * change and may be shared by threads; {@code Requests} may be too; a builder belongs to one
 * thread.
 */
package com.brindlex.kernel.quorvane.client;
