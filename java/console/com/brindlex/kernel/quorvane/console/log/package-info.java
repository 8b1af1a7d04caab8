/** Logs read as a stream: lines, what a log writes around them, and the messages within. */
package com.brindlex.kernel.quorvane.console.log;
