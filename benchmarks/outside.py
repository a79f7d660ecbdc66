#!/usr/bin/env python3
"""The figures that are taken from outside: arrays through the Python package beside the same
formulas in NumPy with single precision, the start of the program, and the import of the package.

    outside.py PROGRAM DOCUMENT BARE_PARSER

DOCUMENT holds one sample; BARE_PARSER starts the XML parser and ends.  Prints a line for each figure: name, value, unit, target, and whether
the target is the "most" or the "least".  Times are medians, those of NumPy and of the package
taken in turn.
"""

import statistics
import subprocess
import sys
import time
from collections.abc import Callable

import numpy
from numpy.typing import NDArray

import aldermoor

Floats = NDArray[numpy.float32]
single = numpy.float32

ROWS = 100_000
ROUNDS = 15


def figure(name: str, value: float, unit: str, target: float | None = None, kind: str = "most") -> None:
    print(name, f"{value:.6g}", unit, "" if target is None else f"{target:g}", kind, sep="\t")


def seconds(action: Callable[[], object]) -> float:
    start = time.perf_counter()
    action()
    return time.perf_counter() - start


# The formulas as one writes them in NumPy; colours are columns.


def lab_of_xyz(xyz: Floats, white: Floats) -> Floats:
    t = xyz / white
    f = numpy.where(t > single(0.008856), numpy.cbrt(t), single(7.787) * t + single(16 / 116))
    x, y, z = f.T
    return numpy.stack([single(116) * y - single(16), single(500) * (x - y), single(200) * (y - z)], axis=1)


def chroma(lab: Floats) -> Floats:
    return numpy.hypot(lab[:, 1], lab[:, 2])


def parts(first: Floats, second: Floats) -> tuple[Floats, Floats, Floats]:
    d = first - second
    lightness, c = d[:, 0], chroma(first) - chroma(second)
    hue = numpy.sqrt(numpy.abs(d[:, 1] ** 2 + d[:, 2] ** 2 - c**2))
    return lightness, c, hue


def cie94(first: Floats, second: Floats) -> Floats:
    lightness, c, hue = parts(first, second)
    c1 = chroma(first)
    sc, sh = single(1) + single(0.045) * c1, single(1) + single(0.015) * c1
    return numpy.sqrt(lightness**2 + (c / sc) ** 2 + (hue / sh) ** 2)


def cmc(first: Floats, second: Floats) -> Floats:
    lightness, c, hue = parts(first, second)
    l1, c1 = first[:, 0], chroma(first)
    h = numpy.degrees(numpy.arctan2(first[:, 2], first[:, 1])) % single(360)
    blue = (h >= 164) & (h <= 345)
    t = numpy.where(
        blue,
        single(0.56) + numpy.abs(single(0.2) * numpy.cos(numpy.radians(h + single(168)))),
        single(0.36) + numpy.abs(single(0.4) * numpy.cos(numpy.radians(h + single(35)))),
    )
    sl = numpy.where(l1 > 16, single(0.040975) * l1 / (single(1) + single(0.01765) * l1), single(0.511))
    sc = single(0.0638) * c1 / (single(1) + single(0.0131) * c1) + single(0.638)
    c4 = c1**4
    f = numpy.sqrt(c4 / (c4 + single(1900)))
    sh = (f * t + single(1) - f) * sc
    return numpy.sqrt((lightness / (single(2) * sl)) ** 2 + (c / sc) ** 2 + (hue / sh) ** 2)


def ciede2000(first: Floats, second: Floats) -> Floats:
    mean = (chroma(first) + chroma(second)) / single(2)
    c7 = mean**7
    stretch = single(1.5) - numpy.sqrt(c7 / (c7 + single(25.0**7))) / single(2)
    a1, a2 = stretch * first[:, 1], stretch * second[:, 1]
    c1, c2 = numpy.hypot(a1, first[:, 2]), numpy.hypot(a2, second[:, 2])
    h1 = numpy.degrees(numpy.arctan2(first[:, 2], a1)) % single(360)
    h2 = numpy.degrees(numpy.arctan2(second[:, 2], a2)) % single(360)
    apart = h2 - h1
    over = numpy.abs(apart) > 180
    dh = numpy.where(over, apart - numpy.copysign(single(360), apart), apart)
    h = (h1 + h2) / single(2) + numpy.where(over, single(180), single(0))
    delta_h = single(2) * numpy.sqrt(c1 * c2) * numpy.sin(numpy.radians(dh / single(2)))
    t = (
        single(1)
        - single(0.17) * numpy.cos(numpy.radians(h - single(30)))
        + single(0.24) * numpy.cos(numpy.radians(single(2) * h))
        + single(0.32) * numpy.cos(numpy.radians(single(3) * h + single(6)))
        - single(0.2) * numpy.cos(numpy.radians(single(4) * h - single(63)))
    )
    grey = ((first[:, 0] + second[:, 0]) / single(2) - single(50)) ** 2
    c = (c1 + c2) / single(2)
    sl = single(1) + single(0.015) * grey / numpy.sqrt(single(20) + grey)
    sc, sh = single(1) + single(0.045) * c, single(1) + single(0.015) * c * t
    theta = single(60) * numpy.exp(-(((h - single(275)) / single(25)) ** 2))
    cm7 = c**7
    rt = -numpy.sin(numpy.radians(theta)) * single(2) * numpy.sqrt(cm7 / (cm7 + single(25.0**7)))
    x, y, z = (first[:, 0] - second[:, 0]) / sl, (c2 - c1) / sc, delta_h / sh
    return numpy.sqrt(x**2 + y**2 + z**2 + rt * y * z)


def beside(name: str, peer: Callable[[], Floats], own: Callable[[], Floats], tolerance: float) -> None:
    """The rate of the package, and how many times as quick as NumPy it is; both compute the same."""
    numpy.testing.assert_allclose(peer(), own(), rtol=tolerance, atol=tolerance)
    times = [(seconds(peer), seconds(own)) for _ in range(ROUNDS)]
    peer_time, own_time = (statistics.median(side) for side in zip(*times))
    figure(f"{name}, Python, {ROWS:,} rows", ROWS / own_time / 1e6, "M/s")
    figure(f"{name}, Python / NumPy", peer_time / own_time, "times", 1.0, "least")


def arrays() -> None:
    random = numpy.random.default_rng(1)
    spectra = random.random((ROWS, 36), dtype=single)
    weights = aldermoor.convert(numpy.eye(36, dtype=single), "CIEXYZ", illuminant="D50")
    white = aldermoor.convert(numpy.ones((1, 36), dtype=single), "CIEXYZ", illuminant="D50")[0]
    xyz = spectra @ weights
    beside("XYZ from spectra", lambda: spectra @ weights,
           lambda: aldermoor.convert(spectra, "CIEXYZ", illuminant="D50"), 1e-3)
    beside("Lab from XYZ", lambda: lab_of_xyz(xyz, white),
           lambda: aldermoor.convert(xyz, "CIELab", source="CIEXYZ", illuminant="D50"), 1e-2)
    first = random.uniform((20, -60, -60), (80, 60, 60), (ROWS, 3)).astype(single)
    second = first + random.uniform(-4, 4, (ROWS, 3)).astype(single)
    for word, peer in (("2000", ciede2000), ("CMC", cmc), ("94", cie94)):
        beside(f"difference {word}", lambda: peer(first, second),
               lambda: aldermoor.delta_e(first, second, word, source="CIELab"), 2e-2)


def start_of_program(program: str, document: str, bare_parser: str) -> None:
    def run(*command: str) -> float:
        return seconds(lambda: subprocess.run(command, check=True, capture_output=True))

    times = [(run(bare_parser), run(program, "color", document)) for _ in range(100)]
    bare, whole = (1000 * statistics.median(side) for side in zip(*times))
    figure("start of the program to the colour of one sample", whole, "ms", 10.0)
    figure("  of it the start of the XML parser alone", bare, "ms")


def import_of_package() -> None:
    def load(names: str) -> float:
        return seconds(lambda: subprocess.run([sys.executable, "-c", f"import {names}"], check=True))

    rounds = [(load("numpy"), load("numpy, aldermoor")) for _ in range(ROUNDS)]
    beyond = statistics.median(both - alone for alone, both in rounds)
    figure("import aldermoor, beyond NumPy", 1000 * beyond, "ms", 100.0)


arrays()
start_of_program(*sys.argv[1:])
import_of_package()
