/** Logs without their secrets: the same log, with other values that are alike everywhere. */
package com.brindlex.kernel.quorvane.console.mask;
