"""Writing: charts from arrays through the new-file writer, read back; the
merge and target writers as the tool runs them."""

import numpy as np
import pytest

import redavudeva
from conftest import EXAMPLES


def test_new_file_has_the_writers_layout(tmp_path):
    # Two sets with names, CMYK and L*a*b*: the new-file writer's own example
    # (the keyword list adds the identification line first).
    chart = redavudeva.Chart.from_arrays(names=["A", "B"], cmyk=[[100, 0, 0, 0], [0, 100, 0, 0]],
                                         lab=[[55, -37, -50], [48, 74, -3]])
    chart.write(tmp_path / "out.it8")
    assert (tmp_path / "out.it8").read_text().split("\n") == [
        "CGATS.17\t", "NUMBER_OF_FIELDS\t9", "BEGIN_DATA_FORMAT",
        "SAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\t\tLAB_L\tLAB_A\tLAB_B",
        "END_DATA_FORMAT", "NUMBER_OF_SETS\t2", "BEGIN_DATA",
        "1\tA\t100.00\t0.00\t0.00\t0.00\t55.00\t-37.00\t-50.00",
        "2\tB\t0.00\t100.00\t0.00\t0.00\t48.00\t74.00\t-3.00", "END_DATA", ""]


def test_every_written_space_reads_back(tmp_path):
    rng = np.random.default_rng(7)
    n = 5
    given = dict(cmyk=rng.uniform(0, 100, (n, 4)).round(2), rgb=rng.integers(0, 256, (n, 3)),
                 xyz=rng.uniform(1, 90, (n, 3)).round(2), lab=rng.uniform(-50, 90, (n, 3)).round(2),
                 ncolor=rng.uniform(0, 100, (n, 6)).round(2),
                 spectra=rng.uniform(0.05, 0.95, (n, 36)).round(5), wavelengths=np.arange(380, 740, 10))
    chart = redavudeva.Chart.from_arrays(names=[f"P{i}" for i in range(n)], **given,
                                         keywords={"DESCRIPTOR": "round trip", "SERIAL": 17})
    assert chart.device == "n-colour"
    chart.write(tmp_path / "out.it8")
    back = redavudeva.read(tmp_path / "out.it8")
    for space in ("cmyk", "rgb", "xyz", "lab", "ncolor", "spectra", "wavelengths"):
        np.testing.assert_array_equal(getattr(back, space), given[space], err_msg=space)
    assert back.names == chart.names
    assert back.ncolor_names == [f"6CLR_{i}" for i in range(1, 7)]
    assert back.keywords["DESCRIPTOR"] == '"round trip"' and back.keywords["SERIAL"] == "17"


def test_a_read_chart_writes_back_after_changes(tmp_path):
    chart = redavudeva.read(EXAMPLES / "press_proof.it8")
    chart.lab[0] = [50.0, 1.0, -1.0]
    chart.write(tmp_path / "edited.it8")
    back = redavudeva.read(tmp_path / "edited.it8")
    np.testing.assert_array_equal(back.lab[0], [50.0, 1.0, -1.0])
    np.testing.assert_allclose(back.spectra, chart.spectra, atol=5e-6)
    assert back.keywords["DESCRIPTOR"] == chart.keywords["DESCRIPTOR"]


REFUSED = [
    (dict(lab=[[50, 0, 0], [np.nan, 0, 0]]), ValueError, "sample 2"),
    (dict(names=["A", "B C"], lab=[[50, 0, 0], [60, 0, 0]]), ValueError, "sample 2"),
    (dict(names=["A", ""], lab=[[50, 0, 0], [60, 0, 0]]), ValueError, "sample 2"),
    (dict(names=["A", "B"]), ValueError, "no values"),
    (dict(), ValueError, "no patches"),
    (dict(lab=[[50, 0, 0]], keywords={"DESCRIPTOR": "two\nlines"}), ValueError, "DESCRIPTOR"),
    (dict(lab=[[50, 0, 0]], keywords={"BEGIN_DATA": "1"}), ValueError, "BEGIN_DATA"),
    (dict(spectra=[[0.5, 0.5]], wavelengths=[380, 380]), ValueError, "distinct"),
    (dict(spectra=[[0.5, 0.5]], wavelengths=[380.5, 390]), ValueError, "whole"),
]


@pytest.mark.parametrize("arrays, error, words", REFUSED)
def test_what_a_chart_file_cannot_carry_is_refused_and_no_file_appears(tmp_path, arrays, error, words):
    with pytest.raises(error, match=words):
        redavudeva.Chart.from_arrays(**arrays).write(tmp_path / "out.it8")
    assert list(tmp_path.iterdir()) == []


@pytest.mark.parametrize("arrays, words", [
    (dict(names=["A"], lab=[[50, 0, 0], [60, 0, 0]]), "lab has 2 patches but names has 1"),
    (dict(lab=[[50, 0]]), r"shape \(1, 3\)"),
    (dict(spectra=[[0.5]]), "wavelengths"),
    (dict(ncolor=[[1, 2]], ncolor_names=["A"]), r"shape \(1, 1\)"),
    (dict(keywords={"2BAD": "x"}), "keyword name"),
])
def test_arrays_that_do_not_fit_together_are_refused(arrays, words):
    with pytest.raises(ValueError, match=words):
        redavudeva.Chart.from_arrays(**arrays)


def test_from_arrays_copies_its_inputs():
    lab = np.array([[50.0, 0.0, 0.0]])
    chart = redavudeva.Chart.from_arrays(lab=lab)
    lab[0, 0] = 99.0
    assert chart.lab[0, 0] == 50.0


@pytest.mark.filterwarnings("ignore:the device values were not compared")
def test_merge_and_target_write_what_the_tool_writes(tmp_path, swatchlog):
    target, sheet = EXAMPLES / "press_target.it8", EXAMPLES / "press_sheet.it8"
    cases = [
        (lambda out: redavudeva.merge(target, sheet, out), ["merge", target, sheet]),
        (lambda out: redavudeva.merge(target, sheet, out, append_missing=True),
         ["merge", target, sheet, "--append-missing"]),
        (lambda out: redavudeva.write_target(target, out), ["target", target]),
    ]
    for i, (write, command) in enumerate(cases):
        ours, tools = tmp_path / f"ours{i}.it8", tmp_path / f"tool{i}.it8"
        write(ours)
        assert swatchlog(*command, "-o", tools).returncode == 0
        assert ours.read_bytes() == tools.read_bytes(), command


def test_merge_refuses_to_overwrite_an_input(tmp_path):
    target = tmp_path / "target.it8"
    target.write_bytes((EXAMPLES / "press_target.it8").read_bytes())
    with pytest.raises(ValueError, match="input file"):
        redavudeva.merge(target, EXAMPLES / "press_sheet.it8", target)
    assert target.read_bytes() == (EXAMPLES / "press_target.it8").read_bytes()
