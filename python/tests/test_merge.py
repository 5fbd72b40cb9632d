"""merge() and write_target() against 'swatchlog merge' and 'swatchlog target':
the same files, the same refusals with the same words, the tool's notes as
warnings."""

import warnings

import numpy as np
import pytest

import redavudeva
from conftest import chart_text

CMYK = ["CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"]
DEVICE = {1: [100, 0, 0, 0], 2: [0, 100, 0, 0], 3: [0, 0, 100, 0]}
LAB = {1: [55, -37, -50], 2: [48, 74, -3], 3: [89, -5, 93]}


def measured(ids, shift=0.0, with_ids=True):
    """Measurement rows for the given sample ids, CMYK moved by `shift`."""
    fields = (["SAMPLE_ID"] if with_ids else []) + CMYK + ["LAB_L", "LAB_A", "LAB_B"]
    rows = [([i] if with_ids else []) + [v + shift if v else v for v in DEVICE[i]] + LAB[i] for i in ids]
    return chart_text(fields, rows)


# Three measurements and one of a patch the target does not have.
EXTRA = measured([1, 2, 3]).replace("NUMBER_OF_SETS 3", "NUMBER_OF_SETS 4").replace(
    "END_DATA\n", "4 0 0 0 100 20 0 0\nEND_DATA\n")

# Each case: the measured chart, merge()'s keywords and the tool's options.
MERGES = {
    "pairs by SAMPLE_ID": (measured([3, 1, 2]), {}, []),
    "append missing": (measured([2, 3, 1]), dict(append_missing=True), ["--append-missing"]),
    "a target patch without a measurement": (measured([1, 2]), {}, []),
    "a measurement without a target patch": (EXTRA, {}, []),
    "left out with allow_unpaired": (EXTRA, dict(allow_unpaired=True), ["--allow-unpaired"]),
    "device values of another chart": (measured([1, 2, 3], shift=-5), {}, []),
    "a wider device tolerance": (measured([1, 2, 3], shift=-5), dict(device_tolerance=6),
                                 ["--device-tolerance", "6"]),
    "by position against the ids": (measured([3, 1, 2]), dict(by="position"), ["--by", "position"]),
    "no ids: by position with a note": (measured([1, 2, 3], with_ids=False), {}, []),
}


def notes(stderr, command):
    prefix = f"swatchlog {command}: "
    return [line[len(prefix):].split(": ", 1)[1] for line in stderr.splitlines() if line.startswith(prefix)]


@pytest.mark.parametrize("case", list(MERGES))
def test_merge_does_what_the_tool_does(tmp_path, write_chart, swatchlog, case):
    text, options, tool_options = MERGES[case]
    target = write_chart(chart_text(["SAMPLE_ID"] + CMYK, [[i] + DEVICE[i] for i in (1, 2, 3)]), "target.it8")
    sheet = write_chart(text, "measured.it8")
    ours, tools = tmp_path / "ours.it8", tmp_path / "tools.it8"
    run = swatchlog("merge", target, sheet, "-o", tools, *tool_options)
    with warnings.catch_warnings(record=True) as issued:
        warnings.simplefilter("always")
        try:
            redavudeva.merge(target, sheet, ours, **options)
        except redavudeva.ChartError as error:
            assert run.returncode == 1, run.stderr
            assert run.stderr.strip() == f"swatchlog merge: {error}"
            assert not ours.exists()
            return
    assert run.returncode == 0, run.stderr
    assert ours.read_bytes() == tools.read_bytes()
    assert [str(w.message) for w in issued] == notes(run.stderr, "merge")
    assert all(w.category is UserWarning for w in issued)
    if not options.get("append_missing"):
        # Each target patch carries the L*a*b* measured for its own id.
        np.testing.assert_array_equal(redavudeva.read(ours).lab, [LAB[1], LAB[2], LAB[3]])


@pytest.mark.parametrize("options, words", [
    (dict(exact=True), "exact goes with append_missing"),
    (dict(by="sample"), "by must be"),
    (dict(device_tolerance=-1), "device_tolerance"),
    (dict(target_table=0), "target_table is a table number from 1"),
])
def test_merge_options_out_of_range_are_value_errors(tmp_path, options, words):
    with pytest.raises(ValueError, match=words):
        redavudeva.merge(tmp_path / "a.it8", tmp_path / "b.it8", tmp_path / "c.it8", **options)


def test_target_refuses_to_lose_clean_patches_unless_forced(tmp_path, write_chart, swatchlog):
    # Paper white first: the target writer stops there and would drop the three
    # clean patches after it.
    chart = write_chart(chart_text(["SAMPLE_ID"] + CMYK, [[1, 0, 0, 0, 0]] + [[i + 1] + DEVICE[i] for i in (1, 2, 3)]))
    with pytest.raises(redavudeva.ChartError, match="would keep 1 of the 4 clean and white patches") as raised:
        redavudeva.write_target(chart, tmp_path / "out.it8")
    assert swatchlog("target", chart, "-o", tmp_path / "tool.it8").stderr.strip() == f"swatchlog target: {raised.value}"
    assert not (tmp_path / "out.it8").exists()
    with pytest.warns(UserWarning, match="would keep 1 of the 4"):
        redavudeva.write_target(chart, tmp_path / "out.it8", force=True)
    assert swatchlog("target", chart, "-o", tmp_path / "tool.it8", "--force").returncode == 0
    assert (tmp_path / "out.it8").read_bytes() == (tmp_path / "tool.it8").read_bytes()


def test_writers_take_a_table_of_a_file_of_several(tmp_path, write_chart, swatchlog):
    target_table = chart_text(["SAMPLE_ID"] + CMYK, [[i] + DEVICE[i] for i in (1, 2, 3)])
    target = write_chart(chart_text(["SAMPLE_ID", "LAB_L", "LAB_A", "LAB_B"], [[1, 50, 0, 0]]) + target_table)
    sheet = write_chart(measured([1, 2, 3]))
    with pytest.warns(UserWarning, match="holds table 2 of"):
        redavudeva.merge(target, sheet, tmp_path / "ours.it8", target_table=2)
    swatchlog("merge", target, sheet, "-o", tmp_path / "tool.it8", "--target-table", "2")
    assert (tmp_path / "ours.it8").read_bytes() == (tmp_path / "tool.it8").read_bytes()
    redavudeva.write_target(target, tmp_path / "target.it8", table=2)
    assert len(redavudeva.read(tmp_path / "target.it8")) == 3
