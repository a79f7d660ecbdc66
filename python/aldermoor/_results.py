"""What functions give back that is more than an array."""

from __future__ import annotations

from typing import TYPE_CHECKING, NamedTuple

if TYPE_CHECKING:
    import numpy
    from numpy.typing import NDArray


class SampleRows(NamedTuple):
    """One row for every sample, in the order of the document."""

    values: NDArray[numpy.float32]
    """Shape (n, 36) or (n, channels); NaN in the rows of samples that cannot give it."""
    names: list[str]
    """The samples."""
    sets: list[str]
    """The sets that hold them."""


class Fault(NamedTuple):
    """Something in a document that a file would not bring back."""

    set: str
    """The name of the sample set; empty for what belongs to the document itself."""
    sample: str
    attribute: str
    """Kind and name, or kind and number from 1: "Spectrum 'M0'", "ColorVector 2"; or empty."""
    reason: str


class ColorRendering(NamedTuple):
    """The general colour rendering index of CIE 13.3-1995, an entry for each light."""

    ra: NDArray[numpy.float32]
    """A whole number, at most 100; NaN for a light without a colour temperature."""
    valid: NDArray[numpy.bool_]
    """Whether the light is near enough to its reference for the index to mean anything."""
    reference: NDArray[numpy.str_]
    """"D50", "D55", "D65", "D75" or "black body"; empty where there is no index."""


class Item(NamedTuple):
    """An item of content that the library does not know; for XML, an element."""

    name: str
    text: str
    attributes: dict[str, str]
    children: tuple[Item, ...]
