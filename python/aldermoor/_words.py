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
SpectrumType = Literal["Remission", "Emission", "Transmission", "AmbientLight", "Flash"]
Reconstructible = Literal["CIELab", "CIEXYZ", "RGB"]
"""Colour spaces with a way to CIELab."""
WavelengthUse = Literal["check", "complete", "as told"]
Spectra = Literal["Spectrum", "Emission"]
Source = Spectra | ColorSpace
Comparable = Spectra | Reconstructible

COLOR_SPACES: tuple[ColorSpace, ...] = get_args(ColorSpace)
OBSERVERS: tuple[Observer, ...] = get_args(Observer)
FORMULAS: tuple[Formula, ...] = get_args(Formula)
DENSITY_STANDARDS: tuple[DensityStandard, ...] = get_args(DensityStandard)
SPECTRUM_TYPES: tuple[SpectrumType, ...] = get_args(SpectrumType)
WAVELENGTHS: tuple[WavelengthUse, ...] = get_args(WavelengthUse)
SOURCES: tuple[str, ...] = (*get_args(Spectra), *COLOR_SPACES)
RECONSTRUCTIBLE: tuple[Reconstructible, ...] = get_args(Reconstructible)

ILLUMINANTS: tuple[str, ...] = (
    "A", "B", "C", "D50", "D55", "D65", "D75",
    *(f"F{number}" for number in range(1, 13)),
    "Emission",
)  # fmt: skip
"""Illuminants with a name; beside them "6500K", a daylight, and 36 values of relative power.

Daylight is defined from 4000K to 25000K; beyond, it is extrapolated without a warning, and the white
of 1000K has a negative Z.
"""
