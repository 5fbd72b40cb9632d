"""Shared helpers of the redavudeva tests: chart text files and the tool."""

import os
import pathlib
import subprocess

import pytest

EXAMPLES = pathlib.Path(os.environ.get("REDAVUDEVA_EXAMPLES", pathlib.Path(__file__).parents[2] / "examples"))


def chart_text(fields, rows, header=""):
    """A minimal CGATS.17 chart: `fields` names, `rows` lists of cells."""
    lines = ["CGATS.17", header.strip(), f"NUMBER_OF_FIELDS {len(fields)}", "BEGIN_DATA_FORMAT",
             " ".join(fields), "END_DATA_FORMAT", f"NUMBER_OF_SETS {len(rows)}", "BEGIN_DATA"]
    lines += [" ".join(str(cell) for cell in row) for row in rows]
    lines.append("END_DATA")
    return "\n".join(line for line in lines if line) + "\n"


@pytest.fixture
def write_chart(tmp_path):
    """Writes chart text (or bytes) to a file in a fresh folder and answers its path."""
    counter = iter(range(1000))

    def write(text, name=None):
        path = tmp_path / (name or f"chart{next(counter)}.it8")
        path.write_bytes(text if isinstance(text, bytes) else text.encode())
        return path

    return write


@pytest.fixture
def swatchlog():
    """Runs the swatchlog tool built beside the module; skips where it is not known."""
    tool = os.environ.get("SWATCHLOG")
    if not tool:
        pytest.skip("the swatchlog tool is not given (SWATCHLOG)")

    def run(*args):
        return subprocess.run([tool, *map(str, args)], capture_output=True, text=True)

    return run
