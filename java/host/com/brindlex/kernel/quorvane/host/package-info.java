/**
 * The library for plain machines, so that an app's tests run without a device.
 *
 * <p>{@code quorvane-host.jar} on the class path is all: {@link
 * com.brindlex.kernel.quorvane.NativeLibrary} finds it by itself.
 */
package com.brindlex.kernel.quorvane.host;
