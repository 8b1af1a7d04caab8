"""What the test kit knows of the protocol: the names of fields."""

from . import console_java, load, words

PATH = "java/testkit/com/brindlex/kernel/quorvane/simulator/FieldTable.java"


def files(whole):
    return {PATH: f"""// {words.GENERATED}
package com.brindlex.kernel.quorvane.simulator;

/** What fields are called, as the test kit reads it: one row for each part of the business. */
final class FieldTable {{
    /** Operations that build requests. */
    static final String[][] OPERATIONS = {{
{console_java.rows(_operations(whole))}    }};

    /** Tags with their names. */
    static final String[][] TAGS = {{
{console_java.rows(_tags(whole))}    }};

    private FieldTable() {{}}
}}
"""}


def _operations(whole):
    for scene in whole["scenes"]:
        yield [one["name"] for one in whole["operations"]
               if one["scene"] == scene["name"] and load.is_encoder(one)]


def _tags(whole):
    for scene in whole["scenes"]:
        row = []
        for tag in load.scene_tags(whole, scene["name"]).values():
            row += [tag["tag"], tag["name"]]
        yield row
