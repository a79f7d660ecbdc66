"""The exceptions of the package."""

from __future__ import annotations

from typing import TYPE_CHECKING

if TYPE_CHECKING:
    from aldermoor._results import Fault


class Error(Exception):
    """A failure of the library; the text says why."""

    trace: tuple[str, ...] = ()
    """Places in the code of the library that the failure passed, innermost first."""


class FileError(Error, OSError):
    """A file cannot be read or written; `errno`, `strerror` and `filename` as of any OSError."""


class MissingFileError(FileError, FileNotFoundError):
    """There is no such file or folder."""


class ParseError(Error, ValueError):
    """What is read is no document; the text says what is wrong.

    `line` and `column`, counted from 1, where the text is not well-formed XML, and `file` if it
    is that of a file.
    """

    file: str | None = None
    line: int | None = None
    column: int | None = None


class SaveError(Error, ValueError):
    """A document is not written, since a file would not bring it back as it is.

    The text has a line for each fault, up to a hundred.
    """

    faults: tuple[Fault, ...] = ()
    """All of them, in the order of the document."""


class WavelengthError(ParseError):
    """The wavelengths of spectra in a file are not those of their conditions.

    The text names set, sample, points and conditions.  `load(..., wavelengths="complete")` takes
    the range from points with one step, `wavelengths="as told"` that of the conditions.
    """


class NotFoundError(Error, LookupError):
    """There is no such set, sample or attribute, and nothing that could give it."""


class MissingConditionError(Error, ValueError):
    """A value comes without a condition that it must have."""


class MeasureError(Error, ValueError):
    """A value cannot be computed."""
