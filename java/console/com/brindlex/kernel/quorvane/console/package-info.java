/**
 * Programs for a terminal: the demonstration of a whole trading session, and what they share for
 * naming and showing the fields of requests, replies and results.
 */
package com.brindlex.kernel.quorvane.console;
