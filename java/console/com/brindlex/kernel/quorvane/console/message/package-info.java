/** Messages of the protocol taken apart: fields, what they mean, and what is wrong with them. */
package com.brindlex.kernel.quorvane.console.message;
