"""Documents come in as their files say, or not at all."""

from pathlib import Path

import numpy
import pytest

import aldermoor


def xml(points: range | list[int], low: str, high: str) -> str:
    """A document with a spectrum of 0.5 at `points`."""
    values = "".join(f"<Value Name='{point}'>0.5</Value>" for point in points)
    conditions = {
        "Physical.NumberOfDataPointsSpectrum": str(len(points)),
        "Physical.SpectrumType": "Remission",
        "Physical.WavelengthSpectrumMin": low,
        "Physical.WavelengthSpectrumMax": high,
    }
    told = "".join(f"<A N='{key}'>{value}</A>" for key, value in conditions.items())
    return (
        f"<VEX Version='1.0'><Name>d</Name><SampleSet><Name>S</Name><Sample><Name>x</Name>"
        f"<SampleAttribute><Spectrum Conditions='1'>{values}</Spectrum></SampleAttribute></Sample>"
        f"</SampleSet><Conditions><ID>1</ID>{told}</Conditions></VEX>"
    )


SHIFTED = xml(range(400, 760, 10), "380nm", "730nm")


def range_of(document: aldermoor.Document) -> tuple[str, str]:
    conditions = document["S"]["x"].attributes[0].conditions
    return (
        conditions["Physical.WavelengthSpectrumMin"],
        conditions["Physical.WavelengthSpectrumMax"],
    )


@pytest.mark.parametrize(
    "text",
    [
        SHIFTED,
        xml(range(380, 740, 10), "730nm", "380nm"),
        xml([380, 400, 410, 730], "380nm", "730nm"),
        xml([-10, 0, 10], "-10nm", "10nm"),
    ],
    ids=["shifted", "reversed", "uneven", "negative"],
)
def test_wavelengths_that_contradict_their_conditions_are_refused(
    text: str, tmp_path: Path
) -> None:
    path = tmp_path / "a.xml"
    path.write_text(text)
    told = "set 'S', sample 'x': .* points at"
    with pytest.raises(aldermoor.WavelengthError, match=told):
        aldermoor.loads(text)
    with pytest.raises(aldermoor.WavelengthError, match=told):
        aldermoor.load(path, cache=True)
    assert not (tmp_path / "Cache").exists()
    assert len(aldermoor.loads(text, wavelengths="as told")["S"]) == 1


def test_the_range_is_taken_from_points_with_one_step() -> None:
    document = aldermoor.loads(SHIFTED, wavelengths="complete")
    assert range_of(document) == ("400nm", "750nm")
    assert range_of(aldermoor.loads(document.dumps())) == ("400nm", "750nm")
    with pytest.raises(aldermoor.WavelengthError, match="no one step"):
        aldermoor.loads(xml([380, 400, 410], "380nm", "410nm"), wavelengths="complete")
    with pytest.raises(ValueError, match="wavelengths: 'guess' is not one of check, complete"):
        aldermoor.loads(SHIFTED, wavelengths="guess")  # type: ignore[arg-type]


def test_spectra_on_another_grid_give_no_colours() -> None:
    document = aldermoor.loads(xml(range(400, 760, 10), "400nm", "750nm"))
    sample = document["S"]["x"]
    with pytest.raises(aldermoor.MeasureError, match="the spectrum is from 400nm to 750nm"):
        sample.color()
    assert numpy.isnan(document.colors().values).all()
    assert numpy.isnan(document.spectra().values).all()
    assert sample.spectrum.shape == (36,)


def test_missing_conditions_are_completed_or_told() -> None:
    legacy = (
        "<VEX><Name/><SampleSet><Name>S</Name><Sample><Name>x</Name><SampleAttribute>"
        "<ColorVector Conditions='1'><Value Name='a'>50</Value><Value Name='b'>0</Value>"
        "<Value Name='c'>0</Value></ColorVector></SampleAttribute></Sample></SampleSet>"
        "<Conditions><ID>1</ID><A N='ColorSpaceDescription.Type'>CIELab</A></Conditions></VEX>"
    )
    given = {"Colorimetric.Illumination": "6500K", "Colorimetric.Observer": "TenDegree"}
    document = aldermoor.loads(legacy, complete=given)
    back = aldermoor.loads(document.dumps())["S"]["x"]
    assert back.color(illuminant="6500K", observer="TenDegree").tolist() == [50, 0, 0]
    del given["Colorimetric.Illumination"]
    with pytest.raises(
        aldermoor.MissingConditionError, match="sample 'x': .* lack Colorimetric.Illumination;"
    ):
        aldermoor.loads(legacy, complete=given)
    for wrong in ({"Colorimetric.Illumination": "D5O"}, {"Observer": "TwoDegree"}):
        with pytest.raises(ValueError, match=r"not one of|neither kind"):
            aldermoor.loads(legacy, complete=wrong)


def test_what_has_no_dates_gets_none() -> None:
    document = aldermoor.loads(xml(range(380, 740, 10), "380nm", "730nm"))
    sample = document["S"]["x"]
    for element in (document, document["S"], sample, sample.attributes[0]):
        assert (element.created, element.modified) == ("", "")
    assert b"Created" not in document.dumps()
