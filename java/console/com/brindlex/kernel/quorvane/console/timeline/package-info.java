/** The timeline of a log: one row a message, replies tied to their requests. */
package com.brindlex.kernel.quorvane.console.timeline;
