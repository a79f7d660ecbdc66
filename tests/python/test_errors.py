"""Failures: the class, the text, the place."""

import errno
import math
import os
import pickle
from collections.abc import Callable
from pathlib import Path
from typing import Any

import numpy
import pytest
from conftest import DATA

import aldermoor

ONES = numpy.ones((2, 36), numpy.float32)
LAB = numpy.ones((2, 3), numpy.float32)
# Arguments that no type checker lets through.
ANY: Any = aldermoor


def sample() -> aldermoor.Sample:
    return aldermoor.Document().add_set("s").add_sample("e")


@pytest.mark.parametrize(
    ("call", "kind", "text"),
    [
        (lambda: ANY.convert([[1.0]]), TypeError, r"values: .*float32 .*\(n, 36\).*got list"),
        (
            lambda: ANY.convert(ONES.astype(float)),
            TypeError,
            r"got float64 with shape \(2, 36\); convert it with \.astype\(numpy\.float32\)",
        ),
        (lambda: ANY.convert(ONES.astype(">f4")), TypeError, r"\.astype\(numpy\.float32\)"),
        (lambda: aldermoor.convert(ONES[:, :35]), ValueError, r"got \(2, 35\)"),
        (lambda: aldermoor.convert(ONES[None]), ValueError, r"got \(1, 2, 36\)"),
        (lambda: aldermoor.convert(LAB), ValueError, r"expected shape \(n, 36\)"),
        (lambda: aldermoor.convert(ONES, source="CIELab"), ValueError, r"expected shape \(n, 3\)"),
        (lambda: ANY.convert(ONES, "CIElab"), ValueError, "space: 'CIElab' is not one of CIELab, "),
        (lambda: ANY.convert(ONES, observer="2"), ValueError, "observer: '2' is not one of"),
        (lambda: ANY.convert(ONES, source="Lab"), ValueError, "source: 'Lab' is not one of Spectrum"),
        (lambda: aldermoor.convert(ONES, illuminant="D51"), ValueError, "illuminant: 'D51' is"),
        (lambda: aldermoor.convert(ONES, illuminant="0K"), ValueError, "'0K' is no daylight"),
        (lambda: aldermoor.convert(ONES, illuminant="99999K"), ValueError, "is no daylight"),
        (lambda: aldermoor.convert(ONES, illuminant=[1, 2]), ValueError, "36 numbers, got 2"),
        (lambda: ANY.convert(ONES, illuminant=7), TypeError, "illuminant: expected 36 numbers"),
        (lambda: aldermoor.convert(ONES, paper=[1.0]), ValueError, "paper: expected 36 numbers"),
        (lambda: aldermoor.convert(ONES, "CMYK"), aldermoor.MeasureError, "."),
        (lambda: aldermoor.convert(ONES, out=LAB[:1]), ValueError, r"out: expected shape \(2, 3\)"),
        (lambda: aldermoor.convert(ONES, out=ONES[:, :3]), ValueError, "out: .*C-contiguous"),
        (
            lambda: aldermoor.convert(ONES, out=ONES.reshape(-1)[:6].reshape(2, 3)),
            ValueError,
            "out: overlaps",
        ),
        (lambda: aldermoor.delta_e(ONES, ONES[[0, 0, 1]]), ValueError, "2 and 3 rows"),
        (
            lambda: ANY.delta_e(LAB[:0], LAB[:0], "FMCII", source="CIEXYZ"),
            aldermoor.MeasureError,
            "FMCII",
        ),
        (
            lambda: aldermoor.convert(ONES.view(numpy.ma.MaskedArray)),
            TypeError,
            r"values: .*mask; fill it with \.filled\(numpy\.nan\)",
        ),
        (lambda: aldermoor.density(ONES, paper=[0] * 36), ValueError, "paper: .*above 0"),
        (lambda: ANY.delta_e(ONES, ONES, "1976"), ValueError, "formula: '1976' is not one of"),
        (lambda: ANY.delta_e(ONES, ONES, "CIEDE2000"), ValueError, "did you mean '2000'"),
        (lambda: ANY.density(ONES, "User"), ValueError, "standard: 'User' is not one of DIN"),
        (lambda: ANY.reconstruct(LAB, "CIELCh"), ValueError, "source: 'CIELCh' is not one of"),
        (lambda: aldermoor.Document()["x"], aldermoor.NotFoundError, "SampleSet/x"),
        (lambda: sample().spectrum, aldermoor.NotFoundError, "'e' has no spectrum"),
        (
            lambda: sample().add_spectrum([1, 2]),
            aldermoor.MissingConditionError,
            "Physical.WavelengthSpectrumM",
        ),
        # What a file would not give back.
        (
            lambda: sample().add_color([1, 2]),
            ValueError,
            r"expected 3 numbers for CIELab \(L\*, a\*, b\*\), got 2",
        ),
        (lambda: sample().add_color([1] * 6, "RGB"), ValueError, "for RGB .*, got 6"),
        (lambda: sample().add_color([1] * 3, "CMYK"), ValueError, "expected 4 .*, got 3"),
        (
            lambda: sample().add_color([1] * 3, conditions={"ColorSpaceDescription.Type": "CMYK"}),
            ValueError,
            "for CMYK .*, got 3",
        ),
        (lambda: sample().add_color([1, 2, math.nan]), ValueError, "values: .*finite.*, got nan"),
        (lambda: sample().add_spectrum([-math.inf] * 36), ValueError, "values: .*, got -inf"),
        (lambda: sample().add_spectrum([1e300] * 36), ValueError, "values: .*, got inf"),
        (
            lambda: sample().add_color([1, 2, 3], illuminant=[math.nan] * 36),
            ValueError,
            "illuminant: .*, got nan",
        ),
        (lambda: aldermoor.Document()[0], IndexError, "0 is no index of 0"),
        (lambda: ANY.Document().spectra(type="Light"), ValueError, "type: 'Light' is not one of"),
        (lambda: aldermoor.Sample(), TypeError, "No constructor"),  # type: ignore[call-arg]
    ],
)
def test_what_is_wrong_is_told(
    call: Callable[[], object], kind: type[Exception], text: str
) -> None:
    with pytest.raises(kind, match=text):
        call()


def test_a_text_that_is_no_xml_has_a_place() -> None:
    path = DATA / "illegal" / "tag_mismatch.xml"
    with pytest.raises(aldermoor.ParseError, match="unterminated end tag 'Name'") as caught:
        aldermoor.load(path)
    assert (caught.value.file, caught.value.line) == (str(path), 3)
    assert caught.value.trace and all("/src/aldermoor/" in place for place in caught.value.trace)


@pytest.mark.parametrize("name", sorted(path.name for path in (DATA / "illegal").glob("*.xml")))
def test_no_illegal_document_is_read(name: str) -> None:
    with pytest.raises(aldermoor.ParseError):
        aldermoor.load(DATA / "illegal" / name)


def test_a_text_of_no_file_has_a_place_without_one() -> None:
    with pytest.raises(aldermoor.ParseError) as caught:
        aldermoor.loads("<a>\n<b></a>")
    assert (caught.value.file, caught.value.line) == (None, 2)


def load(path: str | Path) -> None:
    aldermoor.load(path)


def save(path: str | Path) -> None:
    aldermoor.Document().save(path)


@pytest.mark.parametrize("use", [load, save])
@pytest.mark.parametrize(
    ("name", "number"),
    [
        ("none/x.xml", errno.ENOENT),
        ("file/x.xml", errno.ENOTDIR),
        (".", errno.EISDIR),
    ],
)
def test_files_that_cannot_be_used_have_an_error_of_the_system(
    use: Callable[[str | Path], None], name: str, number: int, tmp_path: Path
) -> None:
    (tmp_path / "file").write_text("")
    path = tmp_path / name
    with pytest.raises(OSError) as caught:
        use(path)
    assert isinstance(caught.value, FileNotFoundError) == (number == errno.ENOENT)
    assert isinstance(caught.value, aldermoor.FileError)
    assert (caught.value.errno, caught.value.filename) == (number, str(path))
    assert os.strerror(number) in str(caught.value) and caught.value.trace
    again = pickle.loads(pickle.dumps(caught.value))
    assert (type(again), str(again)) == (type(caught.value), str(caught.value))


@pytest.mark.parametrize("use", [load, save])
def test_paths_that_are_none_are_refused(use: Callable[[str | Path], None]) -> None:
    with pytest.raises(FileNotFoundError):
        use("")
    with pytest.raises(ValueError, match="path: has a NUL"):
        use("a\0b")
