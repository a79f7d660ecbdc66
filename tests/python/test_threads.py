"""Threads: the interpreter runs on during work, and nothing gets mixed up."""

import threading
import time
from collections.abc import Callable
from concurrent.futures import ThreadPoolExecutor

import numpy
import pytest
from conftest import EXAMPLES
from numpy.typing import NDArray

import aldermoor

RANDOM = numpy.random.default_rng(5)
SPECTRA: NDArray[numpy.float32] = RANDOM.random((20_000, 36), numpy.float32)
MANY: NDArray[numpy.float32] = numpy.tile(SPECTRA, (30, 1))


@pytest.mark.parametrize(
    "work",
    [
        lambda: aldermoor.convert(MANY, "LCHhx"),
        lambda: aldermoor.delta_e(MANY, MANY[0]),
        lambda: aldermoor.color_temperature(SPECTRA[:5000]),
    ],
    ids=["convert", "delta_e", "color_temperature"],
)
def test_the_interpreter_is_free_during_work(work: Callable[[], object]) -> None:
    span: list[float] = []

    def run() -> None:
        span.append(time.perf_counter())
        work()
        span.append(time.perf_counter())

    thread = threading.Thread(target=run)
    thread.start()
    turns = []
    while thread.is_alive():
        turns.append(time.perf_counter())
        time.sleep(0.001)
    start, end = span
    assert sum(start < turn < end for turn in turns) > 5


# Each is tried several times while the other thread is certainly at work in the library, which it
# is for seconds; to wait for it would be to end behind it.
@pytest.mark.parametrize(
    "work",
    [
        lambda: aldermoor.convert(SPECTRA[:10], illuminant="F7", paper=SPECTRA[0]),
        lambda: aldermoor.convert(numpy.ones((9, 3), numpy.float32), "CIELCh", source="CIELab"),
        lambda: aldermoor.delta_e(SPECTRA[:10], SPECTRA[1], illuminant="5400K"),
        lambda: aldermoor.density(SPECTRA[:10]),
    ],
    ids=["convert", "convert colours", "delta_e", "density"],
)
def test_arrays_do_not_wait_for_the_library(work: Callable[[], object]) -> None:
    events: list[str] = []

    def occupy() -> None:
        events.append("begin")
        aldermoor.color_temperature(MANY[:60_000])
        events.append("end")

    thread = threading.Thread(target=occupy)
    thread.start()
    for _ in range(3):
        time.sleep(0.05)
        work()
    events.append("worked")
    thread.join()
    assert events == ["begin", "worked", "end"]


def build() -> bytes:
    document = aldermoor.Document("d")
    document.set_header("Created", "")
    for number in range(30):
        sample = document.add_set(f"set {number}").add_sample("s")
        sample.add_spectrum(SPECTRA[number])
        sample.add_color(sample.color(illuminant="F2"), illuminant="F2")
    return b"".join(line for line in document.dumps().split(b"\n") if b"ed>" not in line)


def test_threads_do_not_disturb_each_other() -> None:
    jobs: list[Callable[[], object]] = [
        build,
        lambda: aldermoor.load(EXAMPLES / "chart24.xml").colors(illuminant="A").values.tolist(),
        lambda: aldermoor.convert(SPECTRA[:2000], illuminant="F7").tolist(),
        lambda: aldermoor.delta_e(SPECTRA[:2000], SPECTRA[1], illuminant="C").tolist(),
        lambda: aldermoor.color_temperature(SPECTRA[:100]).tolist(),
        lambda: aldermoor.density(SPECTRA[:2000], paper=SPECTRA[3]).tolist(),
        lambda: aldermoor.reconstruct(numpy.full((20, 3), 40, numpy.float32)).tolist(),
    ]
    expected = [repr(job()) for job in jobs]
    with ThreadPoolExecutor(8) as pool:
        rounds = [[pool.submit(job) for job in jobs] for _ in range(10)]
        for futures in rounds:
            assert [repr(future.result()) for future in futures] == expected
