"""Files of several tables: Chart.tables, read(table=...), errors that name the
table and line, and sample ids as the file writes them."""

import json
import pathlib

import numpy as np
import pytest

import redavudeva
from conftest import chart_text

DISPLAY = pathlib.Path("/usr/share/colord/ti1/display-short.ti1")


def packaged(path):
    if not path.exists():
        pytest.skip(f"{path} is not installed")
    return path


def test_every_table_of_a_packaged_file_is_listed_as_the_tool_lists_it(swatchlog):
    # How a file splits into tables is the tool's code, tested with it; here
    # the module must hand on the same tables and read each one.
    path = packaged(DISPLAY)
    listed = json.loads(swatchlog("info", path, "--format", "json").stdout)["tables"]
    chart = redavudeva.read(path)
    assert len(chart.tables) == len(listed) == 3
    for table, tool in zip(chart.tables, listed):
        assert (table.number, table.first_line, table.last_line, table.rows, table.identification) \
            == (tool["number"], tool["first_line"], tool["last_line"], tool["rows"], tool["identification"])
        assert table.fields == tuple(tool["fields"])
        part = redavudeva.read(path, table=table.number)
        assert part.table == table.number and len(part) == table.rows
        assert not np.isnan(part.xyz).any()
        if "SAMPLE_ID" not in table.fields:  # INDEX numbers the rows of tables 2 and 3
            assert part.sample_ids.tolist() == [str(n) for n in range(1, table.rows + 1)]


def test_the_default_table_is_the_first_with_data_rows(write_chart):
    fields = ["SAMPLE_ID", "LAB_L", "LAB_A", "LAB_B"]
    empty = chart_text(fields, [])  # 8 lines, a data block without rows
    path = write_chart(empty + chart_text(fields, [[1, 50, 1, 2], [2, 60, 3, 4]]))
    chart = redavudeva.read(path)
    assert chart.table == 2 and len(chart.tables) == 2
    np.testing.assert_array_equal(chart.lab, [[50, 1, 2], [60, 3, 4]])
    assert (chart.tables[0].rows, chart.tables[0].data_line) == (0, 7)
    assert (chart.tables[1].first_line, chart.tables[1].last_line) == (9, 18)


def test_a_table_the_file_lacks_is_an_index_error_with_the_tools_words(write_chart, swatchlog):
    lab = chart_text(["SAMPLE_ID", "LAB_L", "LAB_A", "LAB_B"], [[1, 50, 0, 0]])
    path = write_chart(lab + lab)
    with pytest.raises(IndexError) as raised:
        redavudeva.read(path, table=3)
    assert str(raised.value).endswith("the file holds 2 tables, not a table 3")
    printed = swatchlog("info", path, "--table", "3").stderr.strip()
    assert printed == f"swatchlog info: {raised.value}"
    with pytest.raises(ValueError, match="from 1"):
        redavudeva.read(path, table=0)


def test_a_broken_table_names_its_table_and_line(write_chart, swatchlog):
    fields = ["SAMPLE_ID", "LAB_L", "LAB_A", "LAB_B"]
    good = chart_text(fields, [[1, 50, 0, 0]])
    # 9 lines a table; in the second, line 7 of it is BEGIN_DATA and line 8 the
    # row with a value too many: line 17 of the file.
    bad = chart_text(fields, [[1, 50, 0, 0, 7]])
    path = write_chart(good + bad)
    assert path.read_text().splitlines()[16] == "1 50 0 0 7"
    with pytest.raises(redavudeva.ChartError) as raised:
        redavudeva.read(path, table=2)
    assert (raised.value.code, raised.value.table, raised.value.line) == (8, 2, 17)
    assert "table 2 (lines 10-18)" in str(raised.value)
    assert swatchlog("info", path, "--table", "2").stderr.strip() == f"swatchlog info: {raised.value}"
    assert redavudeva.read(path).table == 1


@pytest.mark.parametrize("cells, expected", [
    (["A01", "A02"], ["A01", "A02"]),
    (['"A01"', '"A02"'], ["A01", "A02"]),  # without the quotes, as names are
    (["007", "8"], ["007", "8"]),  # the digits as written, not the numbers
    (["\u00c41", "B1"], ["\u00c41", "B1"]),  # not ASCII: the str array is built another way
])
def test_sample_ids_are_the_files_text(write_chart, cells, expected):
    path = write_chart(chart_text(["SAMPLE_ID", "LAB_L", "LAB_A", "LAB_B"],
                                  [[cell, 50, 0, 0] for cell in cells]))
    chart = redavudeva.read(path)
    assert chart.sample_ids.dtype.kind == "U"
    assert chart.sample_ids.tolist() == expected
    assert chart.sample_numbers.tolist() == [1, 2]
