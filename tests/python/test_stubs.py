"""The stubs say what the module has: classes, members, parameters and their defaults."""

import ast
import inspect
from pathlib import Path
from types import MethodType
from typing import Any

import pytest

import aldermoor
from aldermoor import _core

STUBS = ast.parse((Path(aldermoor.__file__).parent / "_core.pyi").read_text())
CLASSES = {node.name: node for node in STUBS.body if isinstance(node, ast.ClassDef)}
FUNCTIONS = {node.name: node for node in STUBS.body if isinstance(node, ast.FunctionDef)}


def members(node: ast.ClassDef) -> dict[str, ast.FunctionDef]:
    own = {child.name: child for child in node.body if isinstance(child, ast.FunctionDef)}
    for base in node.bases:
        assert isinstance(base, ast.Name)
        own = members(CLASSES[base.id]) | own
    return own


def parameters(function: Any) -> list[tuple[str, object, bool]]:
    return [
        (p.name, p.default, p.kind == p.KEYWORD_ONLY)
        for p in inspect.signature(function).parameters.values()
    ]


def stub_parameters(node: ast.FunctionDef) -> list[tuple[str, object, bool]]:
    rest: list[ast.expr | None] = list(node.args.defaults)
    defaults = [None] * (len(node.args.args) - len(rest)) + rest
    pairs = [(a, d, False) for a, d in zip(node.args.args, defaults)]
    pairs += [(a, d, True) for a, d in zip(node.args.kwonlyargs, node.args.kw_defaults)]
    return [
        (a.arg, ast.literal_eval(d) if d else inspect.Parameter.empty, keyword_only)
        for a, d, keyword_only in pairs
        if a.arg != "self"
    ]


def test_the_names_are_the_same() -> None:
    public = {name for name in vars(_core) if not name.startswith("_")}
    assert public == {name for name in CLASSES | FUNCTIONS if not name.startswith("_")}
    assert public <= set(aldermoor.__all__)


@pytest.mark.parametrize("name", FUNCTIONS)
def test_functions_take_what_the_stubs_say(name: str) -> None:
    function = getattr(_core, name)
    assert parameters(function) == stub_parameters(FUNCTIONS[name])
    assert function.__doc__


@pytest.mark.parametrize("name", [name for name in CLASSES if not name.startswith("_")])
def test_classes_have_what_the_stubs_say(name: str) -> None:
    found = getattr(_core, name)
    stub = members(CLASSES[name])
    ignored = {"__doc__", "__module__", "__new__"}
    own = {key for base in found.__mro__[:-2] for key in vars(base)} - ignored
    assert own == set(stub) | {"__init__"}
    for key, node in stub.items():
        if not key.startswith("__") and not node.decorator_list:
            function = getattr(found, key)
            own_self, *others = parameters(function)
            assert own_self[0] == "self", key
            assert others == stub_parameters(node), key
            # As the method of an object, whichever it is.
            assert parameters(MethodType(function, object())) == stub_parameters(node), key
        assert key.startswith("__") or getattr(found, key).__doc__, key


@pytest.mark.parametrize(
    ("key", "words", "left_out"),
    [
        ("ColorSpaceDescription.Type", aldermoor.COLOR_SPACES, ()),
        ("ColorSpaceDescription.DeltaEFormula", aldermoor.FORMULAS, ()),
        ("Colorimetric.Observer", aldermoor.OBSERVERS, ()),
        ("Colorimetric.Illumination", aldermoor.ILLUMINANTS, ("Userdefined",)),
        ("Colorimetric.DensityStandard", aldermoor.DENSITY_STANDARDS, ("User",)),
        ("Physical.SpectrumType", aldermoor.SPECTRUM_TYPES, ()),
    ],
)
def test_words_are_those_of_the_library(
    key: str, words: tuple[str, ...], left_out: tuple[str, ...]
) -> None:
    assert (*words, *left_out) == _core._words_of(key)
