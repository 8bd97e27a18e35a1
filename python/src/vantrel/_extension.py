"""The extension module of measurement files, which a build may leave out."""

from typing import Any


def extension() -> Any:
    """The extension module of measurement files."""
    try:
        from . import _sheets  # type: ignore[attr-defined]
    except ImportError:
        raise NotImplementedError("vantrel was built without the reader of measurement files")
    return _sheets
