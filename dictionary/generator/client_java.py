"""The generated part of the typed layer: operations, codes, rows and the types of replies, as Java
classes of the package `client`."""

from . import client_codes, client_operations, client_replies, client_rows

FOLDER = "java/client/com/brindlex/kernel/quorvane/client"


def files(whole):
    """The generated classes: for each path its text."""
    sources = {
        "Arguments": client_operations.arguments(whole),
        "Operation": client_operations.operation_enum(whole),
        "Natives": client_operations.natives(whole),
        "ReplyTypes": client_replies.reply_types(whole),
    }
    for table in whole["codes"]:
        name = table.get("javaName") or client_codes.ENUMS.get(table["name"])
        if name:
            sources[name] = client_codes.enum(name, table)
    tables = {table["name"]: table for table in whole["codes"]}
    for name, title, codes in client_codes.NUMBER_CODES:
        sources[name] = client_codes.number_code(name, title, tables.get(codes))
    shapes = client_rows.shapes(whole)
    for name, shape in shapes.items():
        sources[name] = client_rows.row(name, shape, tables)
        if shape["list"]:
            sources[name + "s"] = client_rows.list_of(name, shape)
    return {f"{FOLDER}/{name}.java": text for name, text in sources.items()}
