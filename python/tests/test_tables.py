"""Files of several tables: Chart.tables, read(table=...), errors that name the
table and line, and sample ids as the file writes them."""

import pathlib

import numpy as np
import pytest

import redavudeva
from conftest import chart_text

DISPLAY = pathlib.Path("/usr/share/colord/ti1/display-short.ti1")
STRIP = pathlib.Path("/usr/share/color/argyll/ref/FograStrip3.ti1")


def tables_in(path):
    """(first line, last line, BEGIN_DATA line, data rows, fields) of each table,
    worked out here from the text: a table ends at its END_DATA, and lines after
    the last one belong to the last table."""
    lines = path.read_text(errors="replace").splitlines()
    found, first, data, rows, fields, in_format = [], 1, 0, [], [], False
    for number, line in enumerate(lines, 1):
        words = line.split()
        word = words[0] if words else ""
        if word == "BEGIN_DATA_FORMAT":
            in_format = True
        elif word == "END_DATA_FORMAT":
            in_format = False
        elif in_format:
            fields += [name.upper() for name in words]
        elif word == "BEGIN_DATA":
            data = number
        elif word == "END_DATA":
            found.append([first, number, data, rows, fields])
            first, data, rows, fields = number + 1, 0, [], []
        elif data and words:
            rows.append(words)
    found[-1][1] = len(lines)
    return found


def packaged(path):
    if not path.exists():
        pytest.skip(f"{path} is not installed")
    return path


def test_every_table_of_a_packaged_file_is_listed_and_readable():
    path = packaged(DISPLAY)
    expected = tables_in(path)
    chart = redavudeva.read(path)
    assert len(chart.tables) == len(expected) == 3
    for table, (first, last, data, rows, fields) in zip(chart.tables, expected):
        assert (table.first_line, table.last_line, table.data_line) == (first, last, data)
        assert (table.rows, table.fields, table.identification) == (len(rows), tuple(fields), "CTI1")
    assert [table.number for table in chart.tables] == [1, 2, 3]
    for number, (_, _, _, rows, fields) in enumerate(expected, 1):
        chart = redavudeva.read(path, table=number)
        assert chart.table == number and len(chart) == len(rows)
        rgb = [[float(row[fields.index(f)]) for f in ("RGB_R", "RGB_G", "RGB_B")] for row in rows]
        xyz = [[float(row[fields.index(f)]) for f in ("XYZ_X", "XYZ_Y", "XYZ_Z")] for row in rows]
        # RGB_R and friends of these files are percentages; the library keeps
        # RGB as whole numbers, so compare the measurements exactly and RGB
        # as the library rounds or truncates it (within one).
        np.testing.assert_array_equal(chart.xyz, xyz)
        assert np.abs(chart.rgb - np.asarray(rgb)).max() <= 1
        if "SAMPLE_ID" in fields:
            assert chart.sample_ids.tolist() == [row[fields.index("SAMPLE_ID")] for row in rows]
        else:  # the second and third tables number their rows with INDEX
            assert chart.sample_ids.tolist() == [str(n) for n in range(1, len(rows) + 1)]


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


def test_a_packaged_file_whose_first_table_is_broken(swatchlog):
    path = packaged(STRIP)
    with pytest.raises(redavudeva.ChartError) as raised:
        redavudeva.read(path)
    # Its first table declares NUMBER_OF_FIELDS 9 on line 16 for the 8 names on line 17.
    assert (raised.value.code, raised.value.table, raised.value.line) == (5, 1, 17)
    assert raised.value.path == str(path)
    assert swatchlog("info", path).stderr.strip() == f"swatchlog info: {raised.value}"
    second = redavudeva.read(path, table=2)
    assert second.device == "CMYK" and len(second) == len(tables_in(path)[1][3])


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
