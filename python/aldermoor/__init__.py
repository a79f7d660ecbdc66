"""Colour-measurement data: documents, and colorimetry on NumPy arrays.

    import aldermoor

    document = aldermoor.load("chart24.xml")
    lab = document["chart"]["red"].color("CIELab", illuminant="D50")
    values, names, sets = document.spectra()
    xyz = aldermoor.convert(values, "CIEXYZ", illuminant="D65", observer="TenDegree")

Arrays are float32; spectra have 36 values, 380 nm to 730 nm by 10 nm.  See docs/python.md.
"""

from aldermoor._core import (
    Attribute,
    ColorVector,
    Document,
    Recipe,
    Sample,
    SampleSet,
    Spectrum,
    __version__,
    channels,
    color_rendering,
    color_temperature,
    convert,
    delta_e,
    density,
    load,
    loads,
    reconstruct,
    release_unused_conditions,
)
from aldermoor._errors import (
    Error,
    FileError,
    MeasureError,
    MissingConditionError,
    MissingFileError,
    NotFoundError,
    ParseError,
    SaveError,
    WavelengthError,
)
from aldermoor._results import ColorRendering, Fault, Item, SampleRows
from aldermoor._words import (
    COLOR_SPACES,
    DENSITY_STANDARDS,
    FORMULAS,
    ILLUMINANTS,
    OBSERVERS,
    SPECTRUM_TYPES,
)

__all__ = [
    "COLOR_SPACES",
    "DENSITY_STANDARDS",
    "FORMULAS",
    "ILLUMINANTS",
    "OBSERVERS",
    "SPECTRUM_TYPES",
    "Attribute",
    "ColorRendering",
    "ColorVector",
    "Document",
    "Error",
    "Fault",
    "FileError",
    "Item",
    "MeasureError",
    "MissingConditionError",
    "MissingFileError",
    "NotFoundError",
    "ParseError",
    "Recipe",
    "Sample",
    "SampleRows",
    "SampleSet",
    "SaveError",
    "Spectrum",
    "WavelengthError",
    "__version__",
    "channels",
    "color_rendering",
    "color_temperature",
    "convert",
    "delta_e",
    "density",
    "load",
    "loads",
    "reconstruct",
    "release_unused_conditions",
]
