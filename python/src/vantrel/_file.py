"""Text into files: the whole of it, or the old file stays."""

import os
import secrets
import shutil
import stat
from typing import Iterable, Union


def write_text(
    file: Union[str, "os.PathLike[str]"], text: str, read_from: Iterable[str]
) -> None:
    """Makes or replaces a file; ValueError where it is one of those that the text was made from.

    It is written beside the old one, with its rights and owner, and renamed.
    """
    path = os.path.realpath(file)
    try:
        old = os.stat(path)
    except FileNotFoundError:
        old = None
    for source in read_from:
        if old and os.path.exists(source) and os.path.samefile(path, source):
            raise ValueError(f"file: {os.fspath(file)} is the measurement itself; name another file")
    if old and not stat.S_ISREG(old.st_mode):  # a pipe or a device
        with open(path, "w", encoding="utf-8", newline="") as opened:
            opened.write(text)
        return
    beside = os.path.join(os.path.dirname(path), f".vantrel.{secrets.token_hex(8)}")
    try:
        with open(beside, "x", encoding="utf-8", newline="") as opened:
            opened.write(text)
        if old:
            made = os.stat(beside)
            if (made.st_uid, made.st_gid) != (old.st_uid, old.st_gid):
                os.chown(beside, old.st_uid, old.st_gid)
            shutil.copystat(path, beside)  # access lists too
            os.utime(beside)
        os.replace(beside, path)
    except BaseException:
        if os.path.exists(beside):
            os.unlink(beside)
        raise
