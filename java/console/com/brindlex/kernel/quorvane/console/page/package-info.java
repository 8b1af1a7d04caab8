/** The page for the browser, and the server on the loopback address that answers it. */
package com.brindlex.kernel.quorvane.console.page;
