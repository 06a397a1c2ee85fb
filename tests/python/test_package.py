"""The package as a whole: types, documentation, the example."""

import ast
import csv
import inspect
import pathlib
import subprocess
import sys

import pytest
from conftest import shared_data

import gridbay_setup

TOP = pathlib.Path(__file__).resolve().parents[2]
EXAMPLE = TOP / "examples" / "python" / "variants.py"
PACKAGE = pathlib.Path(gridbay_setup.__file__).parent


def run(*words):
    return subprocess.run([sys.executable, *map(str, words)], capture_output=True, text=True, check=False)


def test_types_of_package_and_example(tmp_path, monkeypatch):
    script = tmp_path / "slip.py"
    script.write_text("import gridbay_setup\nsetup = gridbay_setup.new()\n"
                      "setup.hydrodynamic.resistance.areas[1].constant_value = 25\n"
                      "setup.hydrodynamic.resistance.areas[1].constant_value = 'rough'\n"
                      "setup.nested_model_globals.simulation_period.start_tim = None\n"
                      "path: str = setup.hydrodynamic.resistance.formulation\n")  # fmt: skip
    monkeypatch.setenv("MYPYPATH", f"{tmp_path}:{EXAMPLE.parent}")
    result = run("-m", "mypy", "--strict", "--cache-dir", tmp_path / "cache", "-p", "gridbay_setup", "-m", "variants",
                 "-m", "slip")  # fmt: skip
    errors = [line.split(":")[:2] for line in result.stdout.splitlines() if ": error:" in line]
    assert [(pathlib.Path(file).name, line) for file, line in errors] == [
        ("slip.py", "4"), ("slip.py", "5"), ("slip.py", "6")], result.stdout + result.stderr  # fmt: skip


def test_the_stubs_are_those_of_the_modules(monkeypatch):
    monkeypatch.setenv("MYPYPATH", str(PACKAGE.parent))
    result = run("-m", "mypy.stubtest", "--allowlist", pathlib.Path(__file__).with_name("stubtest_allowlist.txt"),
                 "gridbay_setup._flow_model", "gridbay_setup._wetland_sweep_kit", "gridbay_setup.model")  # fmt: skip
    assert result.returncode == 0, result.stdout + result.stderr


def documented(stub):
    """The docstring of each class, function, member and attribute of a stub, by its name; without the private."""
    def within(body, prefix):
        for node, after in zip(body, [*body[1:], None]):
            if isinstance(node, (ast.ClassDef, ast.FunctionDef)):
                yield prefix + node.name, ast.get_docstring(node)
                yield from within(node.body if isinstance(node, ast.ClassDef) else [], f"{prefix}{node.name}.")
            elif isinstance(node, ast.AnnAssign) and prefix:
                text = after.value.value if isinstance(after, ast.Expr) else None
                yield prefix + node.target.id, text and inspect.cleandoc(text)

    tree = ast.parse((PACKAGE / stub).read_text(encoding="utf-8"))
    return {name: text for name, text in within(tree.body, "") if not name.split(".")[-1].startswith("_")}


def test_the_stubs_say_what_help_says():
    model = documented("model.pyi")
    kinds = {name: kind for name, kind in vars(gridbay_setup.model).items()
             if isinstance(kind, type) and kind.__module__ == "gridbay_setup.model"}  # fmt: skip
    told = {name: kind.__doc__ for name, kind in kinds.items()}
    told |= {f"{name}.{field}": what.__doc__ for name, kind in kinds.items() for field, what in kind.fields().items()}
    assert model == told
    depth = model["NestedModelGlobalsFloodAndDry.drying_depth"]
    assert "(m)" in depth and "0.02 in a new setup" in depth
    native = documented("_flow_model.pyi")
    assert [name for name, text in native.items() if not text] == []
    assert native["Flooding_V27FlowModel.setHDBndCondition_Value"].startswith("Formulation 1 is a level in m")
    assert native["_FloodMembers.setRain_Value"] == "Millimetres per day."
    assert "run one after the other" in native["CClimateChange_V27"]
    lines = sum(len((PACKAGE / stub).read_text().splitlines()) for stub in ("model.pyi", "_flow_model.pyi"))
    assert lines < 10000


def test_help_tells_units_and_defaults():
    kind = type(gridbay_setup.new().nested_model_globals.flood_and_dry)
    words = f"print(pydoc.render_doc(m.{kind.__name__}, renderer=pydoc.plaintext))"
    text = run("-c", f"import pydoc, gridbay_setup.model as m; {words}").stdout
    assert "drying_depth" in text and "(m)" in text and "in a new setup" in text


def test_every_public_thing_is_documented():
    for name in gridbay_setup.__all__:
        assert getattr(gridbay_setup, name).__doc__, name


def test_variants_of_a_street_flood(tmp_path):
    if not shared_data().exists():
        pytest.skip("the measurements are not here")
    result = run(EXAMPLE, shared_data(), tmp_path)
    assert result.returncode == 0, result.stdout + result.stderr
    assert "100 variants, 0 with messages" in result.stdout
    rows = list(csv.reader((tmp_path / "variants.csv").open()))
    assert len(rows) == 101
    setup = gridbay_setup.open(tmp_path / "variant_012.v27")
    assert setup.hydrodynamic.resistance.areas[1].constant_value == float(rows[12][1]) == 16.0
    assert setup.hydrodynamic.source_and_sink.precipitation_section.file_name.name == "rain_2.tsb0"


def test_variants_of_another_setup(tmp_path, setup):
    data = tmp_path / "data"
    data.mkdir()
    grid = setup.nested_model_globals.bathymetry_selection.areas[1].data_file
    pathlib.Path(tmp_path / "bay.tsb2").rename(data / "bay.tsb2")
    grid.file_name = data / "bay.tsb2"
    setup.save(data / "estuary.v27")
    result = run(EXAMPLE, data, tmp_path / "out", "--count", "3")
    assert result.returncode == 0, result.stdout + result.stderr
    assert "3 variants, 0 with messages" in result.stdout
    assert run(EXAMPLE, tmp_path / "nowhere", tmp_path / "out").returncode == 2


def test_nothing_but_the_entry_points_is_exported():
    for module in ("_flow_model", "_wetland_sweep_kit"):
        named = subprocess.run(["nm", "-D", "--defined-only", PACKAGE / f"{module}.so"], capture_output=True, text=True,
                               check=True).stdout.split("\n")  # fmt: skip
        symbols = {line.split()[-1] for line in named if line}
        assert f"PyInit_{module}" in symbols and all(symbol.startswith("PyInit_") for symbol in symbols)
