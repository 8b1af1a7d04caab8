package com.brindlex.kernel.quorvane.console.command;

import java.nio.charset.Charset;
import picocli.CommandLine.ITypeConverter;
import picocli.CommandLine.TypeConversionException;

/** Finds a charset by the name that a user gave it. */
final class CharsetName implements ITypeConverter<Charset> {
    @Override
    public Charset convert(String name) {
        try {
            return Charset.forName(name);
        } catch (IllegalArgumentException unknown) {
            throw new TypeConversionException("'" + name + "' is no charset that is known here");
        }
    }
}
