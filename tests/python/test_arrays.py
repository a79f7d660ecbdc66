"""Colorimetry on arrays, against published figures and against single samples."""

import itertools
from collections.abc import Callable
from functools import partial
from pathlib import Path

import numpy
import pytest
from numpy.typing import NDArray

import aldermoor
from aldermoor._words import ColorSpace, Formula, Observer, Spectra, SpectrumType

Floats = NDArray[numpy.float32]
PERFECT = numpy.ones((1, 36), numpy.float32)


def row(*values: float) -> Floats:
    return numpy.array([values], numpy.float32)


@pytest.fixture
def spectra(chart: aldermoor.Document) -> Floats:
    return chart.spectra().values


# CIE 15 and ASTM E308, tables of white points.
@pytest.mark.parametrize(
    ("illuminant", "observer", "white"),
    [
        ("A", "TwoDegree", (109.850, 100, 35.585)),
        ("D50", "TwoDegree", (96.422, 100, 82.522)),
        ("D65", "TwoDegree", (95.047, 100, 108.883)),
        ("D65", "TenDegree", (94.811, 100, 107.305)),
    ],
)
def test_the_perfect_reflector_has_the_published_white(
    illuminant: str, observer: Observer, white: tuple[float, ...]
) -> None:
    xyz = aldermoor.convert(PERFECT, "CIEXYZ", illuminant=illuminant, observer=observer)
    numpy.testing.assert_allclose(xyz[0], white, atol=0.002)


# Sharma, Wu, Dalal: The CIEDE2000 color-difference formula, table 1.
@pytest.mark.parametrize(
    ("first", "second", "difference"),
    [
        ((50, 2.6772, -79.7751), (50, 0, -82.7485), 2.0425),
        ((50, -0.001, 2.49), (50, 0.0011, -2.49), 4.7461),
        ((50, 2.5, 0), (73, 25, -18), 27.1492),
        ((2.0776, 0.0795, -1.135), (0.9033, -0.0636, -0.5514), 0.9082),
    ],
)
def test_ciede2000_has_the_published_figures(
    first: tuple[float, ...], second: tuple[float, ...], difference: float
) -> None:
    found = aldermoor.delta_e(row(*first), row(*second), "2000", source="CIELab")
    numpy.testing.assert_allclose(found, [difference], atol=0.0001)


@pytest.mark.parametrize("illuminant", ["D50", "A", "F11", "7000K", [1.0] * 36])
@pytest.mark.parametrize("observer", aldermoor.OBSERVERS)
def test_arrays_equal_samples_to_the_last_bit(
    chart: aldermoor.Document, spectra: Floats, illuminant: str | list[float], observer: Observer
) -> None:
    spaces = [space for space in aldermoor.COLOR_SPACES if space != "CMYK"]
    for space in spaces:
        expected = chart.colors(space, illuminant=illuminant, observer=observer).values
        found = aldermoor.convert(spectra, space, illuminant=illuminant, observer=observer)
        numpy.testing.assert_array_equal(found, expected, err_msg=space)
        assert not numpy.isnan(found).any()


@pytest.mark.parametrize("paper", [None, numpy.linspace(0.8, 0.9, 36)])
@pytest.mark.parametrize("illuminant", ["D50", "F11", "7000K", [1.0] * 36, "Emission"])
def test_lights_equal_samples_to_the_last_bit(
    spectra: Floats, illuminant: str | list[float], paper: NDArray[numpy.float64] | None
) -> None:
    document = aldermoor.Document()
    samples = document.add_set("s")
    shines = {"Colorimetric.Illumination": "Emission"}
    emission = {"Physical.SpectrumType": "Emission"}
    transmission = {"Physical.SpectrumType": "Transmission"}
    kinds: list[dict[str, str]] = [{}, shines, shines | emission, transmission]
    for values, conditions in zip(spectra, itertools.cycle(kinds)):
        samples.add_sample("x").add_spectrum(values, conditions)
    rows: dict[SpectrumType, list[int]] = {"Remission": [0], "Emission": [1, 2]}
    sources: dict[SpectrumType, Spectra] = {"Remission": "Spectrum", "Emission": "Emission"}
    for kind, source in sources.items():
        values = document.spectra(type=kind).values
        there = numpy.isin(numpy.arange(24) % 4, rows[kind])
        numpy.testing.assert_array_equal(~numpy.isnan(values).any(axis=1), there)
        if illuminant == "Emission" and kind != "Emission":
            continue  # makes lights of what a document has as reflectances
        for space in aldermoor.COLOR_SPACES:
            if space != "CMYK":
                expected = document.colors(space, illuminant=illuminant, paper=paper).values
                expected[~there] = numpy.nan
                found = aldermoor.convert(
                    values, space, illuminant=illuminant, paper=paper, source=source
                )
                numpy.testing.assert_array_equal(found, expected, err_msg=f"{space} {kind}")
    numpy.testing.assert_array_equal(
        aldermoor.convert(spectra, illuminant="Emission", paper=paper),
        aldermoor.convert(spectra, illuminant="Emission", paper=paper, source="Emission"),
    )


def test_colours_go_from_space_to_space(spectra: Floats) -> None:
    lab = aldermoor.convert(spectra, "CIELab")
    xyz = aldermoor.convert(lab, "CIEXYZ", source="CIELab")
    numpy.testing.assert_allclose(xyz, aldermoor.convert(spectra, "CIEXYZ"), rtol=1e-5)
    cmyk = row(0, 100, 100, 0)
    rgb = aldermoor.convert(cmyk, "RGB", source="CMYK")
    numpy.testing.assert_allclose(rgb, [[255, 0, 0]], atol=1e-6)
    back = lab.copy()
    assert aldermoor.convert(back, "CIELCh", source="CIELab", out=back) is back
    numpy.testing.assert_array_equal(back, aldermoor.convert(lab, "CIELCh", source="CIELab"))


def test_one_row_may_come_without_its_axis(spectra: Floats) -> None:
    assert aldermoor.convert(spectra[0]).tolist() == aldermoor.convert(spectra)[0].tolist()
    assert aldermoor.density(spectra[0]).shape == (4,)
    assert aldermoor.delta_e(spectra[0], spectra[1]).shape == ()
    assert aldermoor.delta_e(spectra[0], spectra[:1]).shape == (1,)
    assert float(aldermoor.color_temperature(spectra[0])) > 0
    assert aldermoor.convert(spectra[:0]).shape == (0, 3)
    assert aldermoor.delta_e(spectra[:0], spectra[:1]).shape == (0,)


def test_every_layout_gives_the_same(spectra: Floats) -> None:
    wide = numpy.zeros((24, 50), numpy.float32)
    wide[:, 7:43] = spectra
    shifted = numpy.frombuffer(b"x" + spectra.tobytes(), numpy.uint8)[1:].view(numpy.float32)
    layouts = {
        "rows of a wider array": wide[:, 7:43],
        "columns first": numpy.asfortranarray(spectra),
        "bottom up": numpy.ascontiguousarray(spectra[::-1])[::-1],
        "every second value": numpy.repeat(spectra, 2, axis=1)[:, ::2],
        "not aligned": shifted.reshape(24, 36),
    }
    lab = aldermoor.convert(spectra)
    kelvins = aldermoor.color_temperature(spectra)
    for name, values in layouts.items():
        numpy.testing.assert_array_equal(aldermoor.convert(values), lab, err_msg=name)
        numpy.testing.assert_array_equal(
            aldermoor.delta_e(values, values[:1]), aldermoor.delta_e(spectra, spectra[:1])
        )
        numpy.testing.assert_array_equal(aldermoor.color_temperature(values), kelvins)
    same = numpy.broadcast_to(spectra[3], (5, 36))
    numpy.testing.assert_array_equal(aldermoor.convert(same), [lab[3]] * 5)
    numpy.testing.assert_array_equal(
        aldermoor.convert(numpy.asfortranarray(lab), "CIELCh", source="CIELab"),
        aldermoor.convert(spectra, "CIELCh"),
    )


def test_results_go_where_they_are_wanted(spectra: Floats, tmp_path: Path) -> None:
    out = numpy.zeros((24, 3), numpy.float32)
    assert aldermoor.convert(spectra, out=out) is out
    numpy.testing.assert_array_equal(out, aldermoor.convert(spectra))
    mapped = numpy.memmap(tmp_path / "out", numpy.float32, "w+", shape=(24, 3))
    assert aldermoor.convert(spectra, out=mapped) is mapped
    numpy.testing.assert_array_equal(mapped, out)
    differences = numpy.zeros(24, numpy.float32)
    assert aldermoor.delta_e(spectra, spectra[0], out=differences) is differences
    assert differences[0] == 0 and (differences[1:] > 0).all()
    before = out.copy()
    with pytest.raises(aldermoor.MeasureError):
        aldermoor.convert(out, "HunterLab", source="CIELab", out=out)
    numpy.testing.assert_array_equal(out, before)


def test_one_is_compared_with_many(spectra: Floats) -> None:
    formulas: tuple[Formula, ...] = ("CIELab", "CMC", "94", "2000")
    lab = aldermoor.convert(spectra)
    for formula in formulas:
        by_spectra = aldermoor.delta_e(spectra[0], spectra, formula)
        by_colours = aldermoor.delta_e(lab[0], lab, formula, source="CIELab")
        numpy.testing.assert_array_equal(by_spectra, by_colours, err_msg=formula)
        numpy.testing.assert_array_equal(
            by_spectra, aldermoor.delta_e(spectra[[0] * 24], spectra, formula)
        )
    numpy.testing.assert_allclose(
        aldermoor.delta_e(lab[0], lab, "CIELab", source="CIELab"),
        numpy.linalg.norm(lab - lab[0], axis=1),
        rtol=1e-5,
    )
    half = aldermoor.delta_e(row(50, 0, 0), row(60, 0, 0), "94", weights=(2, 1, 1), source="CIELab")
    assert half.tolist() == [5]


def test_what_cannot_be_computed_is_nan() -> None:
    black = numpy.zeros((1, 36), numpy.float32)
    assert numpy.isnan(aldermoor.delta_e(black, PERFECT, "FMCII")).tolist() == [True]
    assert numpy.isnan(aldermoor.color_temperature(black)).tolist() == [True]
    rendering = aldermoor.color_rendering(black)
    assert numpy.isnan(rendering.ra).tolist() == [True]
    assert (rendering.valid.tolist(), rendering.reference.tolist()) == ([False], [""])
    found = aldermoor.reconstruct(numpy.concatenate([row(50, 200, 200), row(50, 0, 0)]))
    assert numpy.isnan(found).all(axis=1).tolist() == [True, False]


def rows_of_nan(values: Floats, band: int) -> Floats:
    """`values` with a number missing in every second row."""
    values = values.copy()
    values[::2, band] = numpy.nan
    return values


@pytest.mark.parametrize("band", [0, 17, 35])
def test_what_is_missing_has_no_result(spectra: Floats, band: int) -> None:
    # White and black look like results for NaN: the numbers at the ends of their ranges.
    spectra = numpy.concatenate([spectra, 9 * PERFECT, 9 * PERFECT, 0 * PERFECT, 0 * PERFECT])
    missing = rows_of_nan(spectra, band)
    functions: list[Callable[[Floats], Floats]] = [
        *(partial(aldermoor.convert, space=s) for s in aldermoor.COLOR_SPACES if s != "CMYK"),
        *(partial(aldermoor.density, standard=s) for s in aldermoor.DENSITY_STANDARDS),
        *(partial(aldermoor.delta_e, PERFECT, formula=f) for f in aldermoor.FORMULAS),
    ]
    for function in functions:
        expected = function(spectra)
        assert not numpy.isnan(expected).any(), function
        expected[::2] = numpy.nan
        numpy.testing.assert_array_equal(function(missing), expected, err_msg=str(function))
        assert numpy.isnan(function(missing[0])).all(), function


@pytest.mark.parametrize("source", aldermoor.COLOR_SPACES)
def test_colours_that_miss_a_channel_have_no_result(source: ColorSpace) -> None:
    channels = len(aldermoor.channels(source))
    colors = numpy.linspace(1, 90, 3000 * channels, dtype=numpy.float32).reshape(-1, channels)
    for space, channel in itertools.product(aldermoor.COLOR_SPACES, range(channels)):
        missing = rows_of_nan(colors, channel)
        try:
            expected = aldermoor.convert(colors, space, source=source)
        except aldermoor.MeasureError:
            continue
        expected[::2] = numpy.nan
        found = aldermoor.convert(missing, space, source=source)
        numpy.testing.assert_array_equal(found, expected, err_msg=space)
        if found.shape == missing.shape and channels == 3:
            aldermoor.convert(missing, space, source=source, out=missing)
            numpy.testing.assert_array_equal(missing, expected, err_msg=space)


def test_densities_are_logarithms() -> None:
    greys = numpy.repeat(numpy.array([[1.0], [0.1], [0.01]], numpy.float32), 36, axis=1)
    for standard in aldermoor.DENSITY_STANDARDS:
        densities = aldermoor.density(greys, standard)
        numpy.testing.assert_allclose(densities, [[0] * 4, [1] * 4, [2] * 4], atol=0.001)
    relative = aldermoor.density(greys, "ANSIT", paper=greys[1])
    numpy.testing.assert_allclose(relative[2], [1, 1, 1, 1], atol=0.001)


def planck(kelvin: float) -> Floats:
    metres = numpy.arange(380, 731, 10) * 1e-9
    power = metres**-5.0 / numpy.expm1(1.4388e-2 / (metres * kelvin))
    return numpy.asarray(power / power.max(), numpy.float32)


def test_lights_on_the_locus_have_a_temperature_and_the_ten_degree_observer_is_named() -> None:
    kelvins = numpy.arange(5000, 15000, 10)
    lights = numpy.stack([planck(kelvin) for kelvin in kelvins])
    numpy.testing.assert_allclose(aldermoor.color_temperature(lights), kelvins, rtol=0.001)
    assert (aldermoor.color_rendering(lights).ra > 0).all()
    with pytest.raises(aldermoor.MeasureError, match="TenDegree.* ask for .TwoDegree"):
        aldermoor.color_temperature(lights, observer="TenDegree")


def test_black_bodies_have_their_temperature() -> None:
    kelvins = (2000, 2856, 4000, 6000)
    lights = numpy.stack([planck(kelvin) for kelvin in kelvins])
    # 10 nm and single precision cost a few kelvin.
    numpy.testing.assert_allclose(aldermoor.color_temperature(lights), kelvins, rtol=0.001)
    rendering = aldermoor.color_rendering(lights[:3])
    assert (rendering.ra >= 99).all() and rendering.valid.all()
    assert rendering.reference.tolist() == ["black body"] * 3


def test_reconstructed_spectra_have_the_colour() -> None:
    lab = numpy.array(
        list(itertools.product((30, 60, 90), (-10, 0, 10), (-10, 0, 10))), numpy.float32
    )
    spectra = aldermoor.reconstruct(lab, illuminant="D65", observer="TenDegree")
    assert (spectra >= 0).all() and (spectra <= 1).all()
    back = aldermoor.convert(spectra, illuminant="D65", observer="TenDegree")
    numpy.testing.assert_allclose(back, lab, atol=0.1)


@pytest.mark.parametrize("space", aldermoor.COLOR_SPACES)
def test_channels_have_labels(space: ColorSpace) -> None:
    assert len(aldermoor.channels(space)) == (4 if space == "CMYK" else 3)
