"""Checksums, as repositories have them beside each file and as sha256sum reads them."""

import hashlib

_KINDS = ["md5", "sha1", "sha256"]
_ALL = "SHA256SUMS"


def sha256(data):
    return hashlib.sha256(data).hexdigest()


def write(folder):
    """Writes the sums of every file of the repository, in place of those that were there."""
    for old in [path for kind in _KINDS for path in folder.rglob(f"*.{kind}")]:
        old.unlink()
    files = [path for path in folder.rglob("*") if path.is_file() and path.name != _ALL]
    lines = []
    for path in sorted(files, key=str):
        data = path.read_bytes()
        lines.append(f"{sha256(data)}  {path.relative_to(folder)}\n")
        if path.parent != folder:
            for kind in _KINDS:
                beside = path.with_name(f"{path.name}.{kind}")
                beside.write_text(hashlib.new(kind, data).hexdigest())
    (folder / _ALL).write_text("".join(lines))
