"""The words that arguments take.  They are compared exactly, case included."""

from __future__ import annotations

from typing import Literal, get_args

ColorSpace = Literal[
    "CIELab", "CIELCh", "CIELuv", "CIELChuv", "CIEuvY1960", "CIEuvY1976", "CIEXYZ", "CIExyY",
    "HunterLab", "RxRyRz", "LABhx", "LCHhx", "RGB", "CMYK",
]  # fmt: skip
Observer = Literal["TwoDegree", "TenDegree"]
Formula = Literal["CIELab", "CIELuv", "LABhx", "FMCII", "CMC", "94", "2000"]
DensityStandard = Literal["DIN", "DINNB", "ANSIA", "ANSIE", "ANSII", "ANSIT", "SPI"]

COLOR_SPACES: tuple[ColorSpace, ...] = get_args(ColorSpace)
OBSERVERS: tuple[Observer, ...] = get_args(Observer)
FORMULAS: tuple[Formula, ...] = get_args(Formula)
DENSITY_STANDARDS: tuple[DensityStandard, ...] = get_args(DensityStandard)

SPECTRUM = "Spectrum"
SOURCES: tuple[str, ...] = (SPECTRUM, *COLOR_SPACES)

ILLUMINANTS: tuple[str, ...] = (
    "A", "B", "C", "D50", "D55", "D65", "D75",
    *(f"F{number}" for number in range(1, 13)),
    "Emission",
)  # fmt: skip
"""Illuminants with a name; beside them "6500K", a daylight, and 36 values of relative power."""

RECONSTRUCTIBLE = ("CIELab", "CIEXYZ", "RGB")
"""Colour spaces with a way to CIELab."""
