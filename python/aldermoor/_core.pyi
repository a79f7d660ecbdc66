import os
from collections.abc import Iterator, Mapping, Sequence
from typing import Never

import numpy
from numpy.typing import NDArray

from aldermoor._results import ColorRendering, Fault, Item, SampleRows
from aldermoor._words import (
    ColorSpace,
    Comparable,
    DensityStandard,
    Formula,
    Observer,
    Reconstructible,
    Source,
    SpectrumType,
    WavelengthUse,
)

__version__: str

_Floats = NDArray[numpy.float32]
_Numbers = Sequence[float] | NDArray[numpy.float32] | NDArray[numpy.float64]
_Illuminant = str | _Numbers
_Path = str | bytes | os.PathLike[str] | os.PathLike[bytes]

class _Element:
    def __init__(self, *, _made_by_documents: Never) -> None: ...
    @property
    def name(self) -> str: ...
    @property
    def description(self) -> str: ...
    @property
    def creator(self) -> str: ...
    @property
    def created(self) -> str: ...
    @property
    def modified(self) -> str: ...
    @property
    def header(self) -> dict[str, str]: ...
    def set_header(self, key: str, value: str | None) -> None: ...

class Attribute(_Element):
    @property
    def kind(self) -> str: ...
    @property
    def conditions(self) -> dict[str, str]: ...
    @property
    def custom_illumination(self) -> _Floats | None: ...
    @property
    def content(self) -> Item | None: ...

class Spectrum(Attribute):
    @property
    def values(self) -> _Floats: ...

class ColorVector(Attribute):
    @property
    def space(self) -> str: ...
    @property
    def labels(self) -> tuple[str, ...]: ...
    @property
    def values(self) -> _Floats: ...

class Recipe(Attribute):
    @property
    def assortment(self) -> str: ...
    @property
    def thickness(self) -> float: ...
    @property
    def substrate(self) -> str: ...
    @property
    def components(self) -> list[tuple[str, float]]: ...

class Sample(_Element):
    @property
    def attributes(self) -> list[Attribute]: ...
    @property
    def spectrum(self) -> _Floats: ...
    def color(
        self,
        space: ColorSpace = "CIELab",
        *,
        illuminant: _Illuminant = "D50",
        observer: Observer = "TwoDegree",
        paper: _Numbers | None = None,
    ) -> _Floats: ...
    def add_spectrum(self, values: _Numbers, conditions: Mapping[str, str] = {}) -> Spectrum: ...
    def add_color(
        self,
        values: _Numbers,
        space: ColorSpace = "CIELab",
        *,
        illuminant: _Illuminant = "D50",
        observer: Observer = "TwoDegree",
        conditions: Mapping[str, str] = {},
    ) -> ColorVector: ...

class SampleSet(_Element):
    @property
    def samples(self) -> list[Sample]: ...
    def __iter__(self) -> Iterator[Sample]: ...
    def __len__(self) -> int: ...
    def __getitem__(self, key: str | int, /) -> Sample: ...
    def __contains__(self, key: object, /) -> bool: ...
    def __delitem__(self, name: str, /) -> None: ...
    def rename(self, old: str, new: str) -> str: ...
    def add_sample(self, name: str) -> Sample: ...
    def spectra(self, *, type: SpectrumType | None = None) -> SampleRows: ...
    def colors(
        self,
        space: ColorSpace = "CIELab",
        *,
        illuminant: _Illuminant = "D50",
        observer: Observer = "TwoDegree",
        paper: _Numbers | None = None,
    ) -> SampleRows: ...

class Document(_Element):
    def __init__(self, name: str = "") -> None: ...
    @property
    def sets(self) -> list[SampleSet]: ...
    def __iter__(self) -> Iterator[SampleSet]: ...
    def __len__(self) -> int: ...
    def __getitem__(self, key: str | int, /) -> SampleSet: ...
    def __contains__(self, key: object, /) -> bool: ...
    def __delitem__(self, name: str, /) -> None: ...
    def rename(self, old: str, new: str) -> str: ...
    def add_set(self, name: str) -> SampleSet: ...
    def spectra(self, *, type: SpectrumType | None = None) -> SampleRows: ...
    def colors(
        self,
        space: ColorSpace = "CIELab",
        *,
        illuminant: _Illuminant = "D50",
        observer: Observer = "TwoDegree",
        paper: _Numbers | None = None,
    ) -> SampleRows: ...
    def save(self, path: _Path, cache: bool = False) -> None: ...
    def dumps(self) -> bytes: ...
    def faults(self) -> list[Fault]: ...

def load(
    path: _Path,
    cache: bool = False,
    *,
    no_cache: bool = False,
    complete: Mapping[str, str] | None = None,
    wavelengths: WavelengthUse = "check",
) -> Document: ...
def loads(
    text: str | bytes,
    *,
    complete: Mapping[str, str] | None = None,
    wavelengths: WavelengthUse = "check",
) -> Document: ...
def release_unused_conditions() -> int: ...
def channels(space: ColorSpace) -> tuple[str, ...]: ...
def _words_of(key: str) -> tuple[str, ...]: ...
def convert(
    values: _Floats,
    space: ColorSpace = "CIELab",
    *,
    illuminant: _Illuminant = "D50",
    observer: Observer = "TwoDegree",
    source: Source = "Spectrum",
    paper: _Numbers | None = None,
    out: _Floats | None = None,
) -> _Floats: ...
def delta_e(
    a: _Floats,
    b: _Floats,
    formula: Formula = "2000",
    *,
    weights: tuple[float, float, float] = (0.0, 0.0, 0.0),
    illuminant: _Illuminant = "D50",
    observer: Observer = "TwoDegree",
    source: Comparable = "Spectrum",
    paper: _Numbers | None = None,
    out: _Floats | None = None,
) -> _Floats: ...
def density(
    values: _Floats,
    standard: DensityStandard = "DIN",
    *,
    paper: _Numbers | None = None,
    out: _Floats | None = None,
) -> _Floats: ...
def color_temperature(
    values: _Floats, *, observer: Observer = "TwoDegree", out: _Floats | None = None
) -> _Floats: ...
def color_rendering(values: _Floats) -> ColorRendering: ...
def reconstruct(
    colors: _Floats,
    source: Reconstructible = "CIELab",
    *,
    illuminant: _Illuminant = "D50",
    observer: Observer = "TwoDegree",
    out: _Floats | None = None,
) -> _Floats: ...
