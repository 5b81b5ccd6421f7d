"""The types: complete, and right for the examples."""

import shutil
import subprocess
import sys
from pathlib import Path

import brindle
import pytest

EXAMPLES = sorted((Path(__file__).parents[1] / "examples").glob("*.py"))


def test_the_package_says_that_it_is_typed():
    folder = Path(brindle.__file__).parent
    assert (folder / "py.typed").is_file() and (folder / "_native.pyi").is_file()


@pytest.mark.parametrize("checker", ["mypy --strict", "pyright --warnings"])
def test_the_examples_have_right_types(checker, tmp_path):
    program, *options = checker.split()
    pytest.importorskip(program)
    files = []
    for example in EXAMPLES:  # away from the sources, as a user has them
        files.append(shutil.copy(example, tmp_path))
    interpreter = ["--pythonpath", sys.executable] if program == "pyright" else []
    ran = subprocess.run(
        [sys.executable, "-m", program, *options, *interpreter, *files],
        cwd=tmp_path, capture_output=True, text=True, timeout=300,
    )
    assert ran.returncode == 0, ran.stdout + ran.stderr


def test_a_wrong_type_is_seen(tmp_path):
    pytest.importorskip("mypy")
    wrong = tmp_path / "wrong.py"
    wrong.write_text("import brindle\nroot: int = brindle.Chord('C').root\nbrindle.read(7)\n")
    ran = subprocess.run(
        [sys.executable, "-m", "mypy", "--strict", str(wrong)],
        cwd=tmp_path, capture_output=True, text=True, timeout=300,
    )
    assert "Found 2 errors" in ran.stdout, ran.stdout


@pytest.mark.parametrize("example", EXAMPLES, ids=lambda path: path.name)
def test_the_examples_run(example, tmp_path):
    if example.name in ("corpus.py", "engines.py"):
        pytest.importorskip("pyarrow")
    ran = subprocess.run(
        [sys.executable, str(example)], cwd=tmp_path, capture_output=True, text=True, timeout=120
    )
    assert ran.returncode == 0, ran.stderr
    expected = example.with_suffix(".txt")
    assert ran.stdout == expected.read_text(encoding="utf-8")
