/** The command line: one class for each command of {@code scripts/quorvane}. */
package com.brindlex.kernel.quorvane.console.command;
