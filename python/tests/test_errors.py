"""Failures: ChartError with the library's result code, the file and the
tool's message; the library's standard exceptions as ValueError and IndexError."""

import pytest

import redavudeva
from conftest import chart_text

LAB = ["SAMPLE_ID", "LAB_L", "LAB_A", "LAB_B"]

# Each case: chart text and the result code the reader answers for it.
BROKEN = [
    (chart_text(LAB, [[1, 50, 0, 0]]).replace("END_DATA_FORMAT\n", ""), 5),
    (chart_text(LAB, [[1, 50, 0, 0]]).replace("NUMBER_OF_SETS 1", "NUMBER_OF_SETS 0"), 6),
    (chart_text(LAB, [[1, 50, 0, 0]]).replace("END_DATA\n", ""), 7),
    (chart_text(LAB, [[1, 50, 0, 0, 9]]), 8),
    ("CGATS.17\nORIGINATOR \"x\"\n", 9),
]


@pytest.mark.parametrize("text, code", BROKEN, ids=[str(case[1]) for case in BROKEN])
def test_unreadable_chart_raises_chart_error_with_the_tools_message(write_chart, swatchlog, text, code):
    path = write_chart(text)
    with pytest.raises(redavudeva.ChartError) as raised:
        redavudeva.read(path)
    assert raised.value.code == code
    assert raised.value.path == str(path)
    assert str(raised.value).endswith(f"[code {code}]")
    printed = swatchlog("validate", path).stderr.strip()
    assert printed == f"swatchlog validate: {raised.value}"


def test_missing_file_and_unwritable_output(tmp_path):
    with pytest.raises(redavudeva.ChartError) as raised:
        redavudeva.read(tmp_path / "absent.it8")
    assert (raised.value.code, raised.value.path) == (3, str(tmp_path / "absent.it8"))
    with pytest.raises(redavudeva.ChartError, match="is a folder") as raised:
        redavudeva.read(tmp_path)
    assert (raised.value.code, raised.value.path) == (3, str(tmp_path))
    # A device is refused unopened: reading it could block or never end.
    with pytest.raises(redavudeva.ChartError, match="is a device or a pipe") as raised:
        redavudeva.read("/dev/zero")
    assert raised.value.code == 3
    chart = redavudeva.Chart.from_arrays(lab=[[50, 0, 0]])
    # The output's folder is missing: refused before the library writes, so no result code.
    output = tmp_path / "no such folder" / "out.it8"
    with pytest.raises(redavudeva.ChartError, match="cannot be written") as raised:
        chart.write(output)
    assert (raised.value.code, raised.value.path) == (None, str(output))


@pytest.mark.parametrize("header, fields, error, words", [
    ("NUMBER_OF_STRIPS abc", LAB, ValueError, "invalid stol argument"),
    ("NUMBER_OF_STRIPS 99999999999999999999", LAB, IndexError, "stol argument out of range"),
    ("", ["SAMPLE_ID", "SPECTRAL_380", "SPECTRAL_NM_390"], IndexError, "invalid string position"),
])
def test_library_exceptions_become_standard_python_errors(write_chart, header, fields, error, words):
    path = write_chart(chart_text(fields, [[1] + [0.5] * (len(fields) - 1)], header=header))
    with pytest.raises(error, match=words):
        redavudeva.read(path)


def test_chart_error_is_an_exception_with_code_and_path_attributes():
    assert issubclass(redavudeva.ChartError, Exception)
    assert redavudeva.ChartError.code is None and redavudeva.ChartError.path is None
