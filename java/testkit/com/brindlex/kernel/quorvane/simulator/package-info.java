/**
 * A broker's gateway in one process, for an app's tests, demonstrations and practice.
 *
 * <p>{@link com.brindlex.kernel.quorvane.simulator.Gateway} takes the request texts that the library
 * builds and gives the reply texts that the library reads. It is written from the wire alone and
 * shares no code with the library: every request is parsed for real, down to its doubled bars, its
 * escapes and its signature payload, and refused when it is wrong by one character.
 */
package com.brindlex.kernel.quorvane.simulator;
