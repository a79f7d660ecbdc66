"""Documents: read, walked, built, written."""

import gc
import os
import pickle
from pathlib import Path

import numpy
import pytest
from conftest import DATA, EXAMPLES

import aldermoor


def test_a_document_is_walked_by_name_and_by_order(chart: aldermoor.Document) -> None:
    assert [(s.name, len(s)) for s in chart] == [("chart", 24)]
    assert "chart" in chart and "chart 2" not in chart
    samples = chart["chart"]
    assert [s.name for s in samples][:2] == ["dark skin", "light skin"]
    assert samples["red"] is samples.samples[14] is samples[14] is samples[-10]
    assert samples[-24] is samples[0] and samples[23] is samples[-1]
    for index in (-25, 24):
        with pytest.raises(IndexError, match=f"{index} is no index of 24"):
            samples[index]
    assert all(sample in samples for sample in samples)
    stranger = aldermoor.Document().add_set("s").add_sample("red")
    assert not any(other in samples for other in (stranger, chart, 0, None, "\ud800"))
    assert chart.header["Geometry"] == "45/0"
    assert samples["red"].attributes[0].conditions["Physical.SpectrumType"] == "Remission"


def test_a_sample_gives_the_colour_that_is_asked_for(chart: aldermoor.Document) -> None:
    red = chart["chart"]["red"]
    # The figures of the README and of the chart table.
    numpy.testing.assert_allclose(red.color(illuminant="D50"), [42.28, 54.11, 28.67], atol=0.005)
    white = chart["chart"]["white 9.5"]
    numpy.testing.assert_allclose(
        white.color("CIELCh", illuminant="D50"), [96.53, 2.47, 101.06], atol=0.005
    )
    rgb = red.color("RGB", illuminant="D65")
    assert rgb.tolist() == rgb.round().tolist() and rgb.max() == rgb[0]
    own_paper = white.color("CIEXYZ", paper=white.spectrum)
    numpy.testing.assert_allclose(own_paper, [96.422, 100, 82.522], atol=0.001)


def test_every_way_to_name_an_illuminant(chart: aldermoor.Document) -> None:
    red = chart["chart"]["red"]
    assert red.color(illuminant="6500K").tolist() == red.color(
        illuminant="Dxx, Temperature:6500"
    ).tolist()
    assert red.color(illuminant="6500K").tolist() != red.color(illuminant="5000K").tolist()
    # Equal energy by a curve: the sums of the CIE 1931 functions at 1 nm are 106.865, 106.857 and
    # 106.892, and Y is 100.
    perfect = aldermoor.Document().add_set("s").add_sample("p")
    perfect.add_spectrum(numpy.ones(36))
    xyz = perfect.color("CIEXYZ", illuminant=numpy.ones(36))
    numpy.testing.assert_allclose(xyz, [100.008, 100, 100.033], atol=0.001)


def test_what_is_built_comes_back_from_a_file(tmp_path: Path) -> None:
    document = aldermoor.Document("ramp")
    document.set_header("Operator", "R. S.")
    steps = document.add_set("steps")
    for percent in range(0, 101, 10):
        sample = steps.add_sample(f"grey {percent}")
        sample.add_spectrum(numpy.full(36, percent / 100), {"Physical.Filter": "UVCut"})
        sample.add_color([percent, 0, 0], illuminant="A", conditions={"Origin": "guess"})
    for cache in (False, True):
        path = tmp_path / f"ramp{cache}.xml"
        document.save(path, cache=cache)
        back = aldermoor.load(path)
        assert (back.name, back.header["Operator"]) == ("ramp", "R. S.")
        numpy.testing.assert_array_equal(back.spectra().values, document.spectra().values)
        spectrum, color = back["steps"]["grey 30"].attributes
        assert isinstance(spectrum, aldermoor.Spectrum) and isinstance(color, aldermoor.ColorVector)
        assert spectrum.conditions["Physical.Filter"] == "UVCut"
        assert color.conditions["Origin"] == "guess"
        assert (color.space, color.labels, color.values.tolist()) == (
            "CIELab",
            ("L*", "a*", "b*"),
            [30, 0, 0],
        )
    assert (tmp_path / "Cache" / "rampTrue.vexb").exists()
    assert not (tmp_path / "Cache" / "rampFalse.vexb").exists()
    assert aldermoor.loads(document.dumps()).dumps() == document.dumps()


def test_what_a_file_would_not_bring_back_is_not_saved(tmp_path: Path) -> None:
    document = aldermoor.Document()
    sample = document.add_set("s").add_sample("t")
    span = {"Physical.WavelengthSpectrumMin": "400nm", "Physical.WavelengthSpectrumMax": "700nm"}
    sample.add_spectrum(numpy.ones(31), span)
    assert document.faults() == []
    document.save(tmp_path / "a.xml")
    good = (tmp_path / "a.xml").read_bytes()
    sample.add_spectrum(numpy.ones(31), span | {"Physical.NumberOfDataPointsSpectrum": "36"})
    sample.add_spectrum(numpy.ones(36), {"Physical.WavelengthSpectrumMax": "400nm"})
    sample.set_header("Note", "\x01")
    with pytest.raises(aldermoor.SaveError, match="set 's', sample 't', Spectrum 2: ") as caught:
        document.save(tmp_path / "a.xml", cache=True)
    assert [(f.attribute, f.reason) for f in caught.value.faults] == [
        ("", "the header value 'Note': XML cannot carry the text '\x01'"),
        ("Spectrum 2", "31 values under conditions that name 36"),
        (
            "Spectrum 3",
            "36 values from '380nm' to '400nm' would get equal or falling wavelengths: the step "
            "is in whole nm",
        ),
    ]
    assert tuple(document.faults()) == caught.value.faults
    assert len(str(caught.value).splitlines()) == 4 and caught.value.trace
    assert (tmp_path / "a.xml").read_bytes() == good and not (tmp_path / "Cache").exists()
    again = pickle.loads(pickle.dumps(caught.value))
    assert again.faults == caught.value.faults


def test_names_stay_unique_and_elements_can_go() -> None:
    document = aldermoor.Document()
    samples = document.add_set("s")
    names = [samples.add_sample("red").name for _ in range(3)]
    assert names == ["red", "red (1)", "red (2)"]
    assert samples.rename("red (1)", "blue") == "blue"
    samples.add_sample("red")
    assert samples.rename("red (1)", "red") in samples  # the number that it gives up is free again
    del samples["red (2)"]
    assert [s.name for s in samples] == ["red", "blue", "red (1)"]
    samples["red"].set_header("Creator", "me")
    assert samples["red"].creator == "me"
    samples["red"].set_header("Creator", None)
    assert "Creator" not in samples["red"].header


def test_what_is_unknown_can_be_read() -> None:
    gloss = aldermoor.load(EXAMPLES / "small.xml")["Set 1"]["White"].attributes[1]
    assert type(gloss) is aldermoor.Attribute
    assert gloss.content is not None and gloss.content.name == "Gloss"
    reading = gloss.content.children[-1]
    assert reading == aldermoor.Item("Reading", "71.5", {"Angle": "60"}, ())


def test_recipes_can_be_read() -> None:
    document = aldermoor.load(DATA / "legal" / "recipes.xml")
    recipes = [
        attribute
        for samples in document
        for sample in samples
        for attribute in sample.attributes
        if isinstance(attribute, aldermoor.Recipe)
    ]
    assert recipes and all(r.kind == "VEXRecipe" for r in recipes)
    assert any(r.components for r in recipes)


def test_elements_outlive_their_document() -> None:
    document = aldermoor.load(EXAMPLES / "chart24.xml")
    red = document["chart"]["red"]
    spectrum = red.attributes[0]
    del document["chart"]
    del document
    gc.collect()
    assert red.color().shape == (3,)
    del red
    gc.collect()
    assert isinstance(spectrum, aldermoor.Spectrum) and spectrum.values.shape == (36,)


def test_tables_have_a_row_for_every_sample() -> None:
    document = aldermoor.Document()
    for name in ("first", "second"):
        samples = document.add_set(name)
        samples.add_sample("grey").add_spectrum(numpy.full(36, 0.5))
        samples.add_sample("stored").add_color([40, 1, 2], illuminant="D50")
        samples.add_sample("empty")
    values, names, sets = document.spectra()
    assert values.dtype == numpy.float32
    assert names == ["grey", "stored", "empty"] * 2
    assert sets == ["first"] * 3 + ["second"] * 3
    assert numpy.isnan(values).any(axis=1).tolist() == [False, True, True] * 2
    lab = document["second"].colors("CIELab", illuminant="D50")
    assert lab.sets == ["second"] * 3
    numpy.testing.assert_array_equal(lab.values[1], [40, 1, 2])
    assert numpy.isnan(lab.values).all(axis=1).tolist() == [False, False, True]
    # A stored colour does not become that of another light.
    other = document["second"].colors("CIELab", illuminant="A").values
    assert numpy.isnan(other).all(axis=1).tolist() == [False, True, True]
    with pytest.raises(aldermoor.MeasureError, match="for other conditions"):
        document["second"]["stored"].color(illuminant="A")


def test_a_cache_never_answers_for_another_file_and_can_be_passed_over(tmp_path: Path) -> None:
    path = tmp_path / "paper.xml"
    other = tmp_path / "other.xml"
    for target, name in ((path, "first"), (other, "other")):
        target.write_text((EXAMPLES / "small.xml").read_text().replace("White", name))
        os.utime(target, (1_000_000_000, 1_000_000_000))
    aldermoor.load(path, cache=True)
    assert (tmp_path / "Cache" / "paper.vexb.stamp").exists()
    for no_cache in (False, True):
        assert aldermoor.load(path, no_cache=no_cache)["Set 1"]["first"].name == "first"
    os.replace(other, path)
    assert aldermoor.load(path)["Set 1"].samples[0].name == "other"
    with pytest.raises(ValueError):
        aldermoor.load(path, cache=True, no_cache=True)


def test_conditions_that_nobody_holds_any_more_are_released() -> None:
    def stamped(count: int) -> aldermoor.Document:
        document = aldermoor.Document("stamped")
        samples = document.add_set("set")
        for i in range(count):
            sample = samples.add_sample(f"sample {i}")
            sample.add_spectrum(numpy.ones(36), {"Measured.At": f"{i}:00"})
            sample.add_spectrum(numpy.zeros(36), {"Measured.At": f"{i}:00"})
        return document

    gc.collect()
    aldermoor.release_unused_conditions()
    document = stamped(5)
    kept = document["set"][0].attributes[1]
    assert aldermoor.release_unused_conditions() == 0
    del document
    gc.collect()
    assert aldermoor.release_unused_conditions() == 4
    assert kept.conditions["Measured.At"] == "0:00"
    del kept
    gc.collect()
    assert aldermoor.release_unused_conditions() == 1
