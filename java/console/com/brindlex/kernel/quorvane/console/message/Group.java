package com.brindlex.kernel.quorvane.console.message;

import java.util.List;

/**
 * Fields that belong together.
 *
 * @param title what they are together
 * @param fields the fields in order
 */
public record Group(String title, List<Field> fields) {}
