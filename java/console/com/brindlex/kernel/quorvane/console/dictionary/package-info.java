/** The dictionary of the protocol as the console reads it: plain values from the data files. */
package com.brindlex.kernel.quorvane.console.dictionary;
