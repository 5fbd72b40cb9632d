"""Reading charts into arrays: each colour space, NaN where a value is missing,
what the library derived, spectra on their wavelengths."""

import numpy as np
import pytest

import redavudeva
from conftest import EXAMPLES, chart_text

# Each case: fields and rows of a file, the attribute, its expected rows (from
# the file), and the device space the tool reports.
SPACE_CASES = [
    (["SAMPLE_ID", "CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"], [[1, 10, 20, 30, 40], [2, 0, 0, 0, 100]],
     "cmyk", [[10, 20, 30, 40], [0, 0, 0, 100]], "CMYK"),
    (["SAMPLE_ID", "RGB_R", "RGB_G", "RGB_B"], [[1, 255, 128, 0], [2, 0, 0, 7]],
     "rgb", [[255, 128, 0], [0, 0, 7]], "RGB"),
    (["SAMPLE_ID", "XYZ_X", "XYZ_Y", "XYZ_Z"], [[1, 41.24, 21.26, 1.93], [2, 96.42, 100, 82.49]],
     # L*a*b* derived from XYZ counts as the device space, as for a chart of L*a*b*.
     "xyz", [[41.24, 21.26, 1.93], [96.42, 100, 82.49]], "L*a*b*"),
    (["SAMPLE_ID", "LAB_L", "LAB_A", "LAB_B"], [[1, 50, 10, -10], [2, 0, 0, 0]],
     "lab", [[50, 10, -10], [0, 0, 0]], "L*a*b*"),
    (["SAMPLE_ID", "D_RED", "D_GREEN", "D_BLUE", "D_VIS"], [[1, 0.12, 0.5, 1.2, 0.4], [2, 2.1, 2.2, 2.3, 2.0]],
     "density", [[0.12, 0.5, 1.2, 0.4], [2.1, 2.2, 2.3, 2.0]], "none"),
    (["SAMPLE_ID", "6CLR_1", "6CLR_2", "6CLR_3", "6CLR_4", "6CLR_5", "6CLR_6"],
     [[1, 0, 0, 0, 0, 0, 0], [2, 100, 0, 0, 0, 50, 0]],
     "ncolor", [[0] * 6, [100, 0, 0, 0, 50, 0]], "n-colour"),
]


@pytest.mark.parametrize("fields, rows, attribute, expected, device", SPACE_CASES,
                         ids=[case[2] for case in SPACE_CASES])
def test_each_colour_space_reads_as_a_float_array(write_chart, fields, rows, attribute, expected, device):
    chart = redavudeva.read(write_chart(chart_text(fields, rows)))
    values = getattr(chart, attribute)
    assert values.dtype == np.float64
    np.testing.assert_array_equal(values, expected)
    assert not chart.derived[attribute].any()
    assert chart.device == device
    assert chart.sample_ids.tolist() == ["1", "2"]
    np.testing.assert_array_equal(chart.sample_numbers, [1, 2])
    # Spaces nothing here derives are NaN throughout, in their full shape.
    for other, channels in (("cmyk", 4), ("density", 4)):
        if other != attribute:
            assert getattr(chart, other).shape == (2, channels)
            assert np.isnan(getattr(chart, other)).all(), other


def test_ncolor_channels_keep_their_field_names(write_chart):
    chart = redavudeva.read(write_chart(chart_text(SPACE_CASES[5][0], SPACE_CASES[5][1])))
    assert chart.ncolor_names == [f"6CLR_{i}" for i in range(1, 7)]


def test_lab_derived_from_xyz_is_marked_and_follows_the_cie_formula(write_chart):
    xyz = [[41.24, 21.26, 1.93], [96.38, 100.0, 82.45]]
    chart = redavudeva.read(write_chart(chart_text(["SAMPLE_ID", "XYZ_X", "XYZ_Y", "XYZ_Z"],
                                                   [[i + 1, *v] for i, v in enumerate(xyz)])))
    # CIE 1976 L*a*b* against the patches' reference white (96.38, 100, 82.45).
    t = np.asarray(xyz) / [96.38, 100.0, 82.45]
    f = np.where(t > (6 / 29) ** 3, np.cbrt(t), t / (3 * (6 / 29) ** 2) + 4 / 29)
    expected = np.stack([116 * f[:, 1] - 16, 500 * (f[:, 0] - f[:, 1]), 200 * (f[:, 1] - f[:, 2])], axis=1)
    np.testing.assert_allclose(chart.lab, expected, atol=1e-6)
    assert chart.derived["lab"].all() and not chart.derived["xyz"].any()


def spectral_chart(rows_of_values, names=("SPECTRAL_NM_{}",)):
    wavelengths = range(380, 740, 10)
    fields = ["SAMPLE_ID"] + [names[0].format(nm) for nm in wavelengths]
    return chart_text(fields, [[i + 1, *values] for i, values in enumerate(rows_of_values)])


def test_spectra_read_on_their_wavelengths_with_derived_colorimetry(write_chart):
    flat = [0.5] * 36
    ramp = [round(0.1 + 0.02 * i, 5) for i in range(36)]
    chart = redavudeva.read(write_chart(spectral_chart([flat, ramp], names=("SPECTRAL_{}",))))
    np.testing.assert_array_equal(chart.wavelengths, np.arange(380, 740, 10))
    np.testing.assert_array_equal(chart.spectra, [flat, ramp])
    # A flat 50 % reflector has Y = 50 under any illuminant with Y = 100 for white.
    assert chart.xyz[0, 1] == pytest.approx(50.0, abs=0.01)
    assert chart.derived["xyz"].all() and chart.derived["lab"].all() and chart.derived["density"].all()
    assert np.isnan(chart.cmyk).all()  # densities kept as CMYK are not device values
    assert chart.device == "none"


def test_a_spectrum_the_engine_refuses_leaves_nan_for_that_patch_only(write_chart):
    refused = [0.5] * 35 + ["1e40"]  # beyond single precision
    chart = redavudeva.read(write_chart(spectral_chart([[0.5] * 36, refused])))
    assert np.isfinite(chart.xyz[0]).all()
    assert np.isnan(chart.xyz[1]).all() and np.isnan(chart.lab[1]).all()
    assert chart.derived["xyz"].tolist() == [True, False]


def test_wavelengths_sort_numerically_past_one_thousand_nm(write_chart):
    fields = ["SAMPLE_ID", "SPECTRAL_NM_1000", "SPECTRAL_NM_980", "SPECTRAL_NM_990"]
    chart = redavudeva.read(write_chart(chart_text(fields, [[1, 0.3, 0.1, 0.2]])))
    np.testing.assert_array_equal(chart.wavelengths, [980, 990, 1000])
    np.testing.assert_array_equal(chart.spectra, [[0.1, 0.2, 0.3]])


def test_names_keywords_and_path_forms(write_chart):
    text = chart_text(["SAMPLE_ID", "SAMPLE_NAME", "LAB_L", "LAB_A", "LAB_B"],
                      [[1, '"Cyan-25"', 50, 0, 0], [2, "Paper", 95, 0, 0]],
                      header='DESCRIPTOR "Press proof"\nCREATED "2026-12-06"')
    path = write_chart(text)
    for given in (path, str(path), bytes(path)):
        chart = redavudeva.read(given)
        assert chart.names == ["Cyan-25", "Paper"]
        assert chart.keywords["DESCRIPTOR"] == '"Press proof"'
        assert chart.keywords["CREATED"] == '"2026-12-06"'
        assert chart.path == str(path)
        assert len(chart) == 2


def test_bytes_that_are_not_utf8_survive_as_surrogates(write_chart):
    text = chart_text(["SAMPLE_ID", "SAMPLE_NAME", "LAB_L", "LAB_A", "LAB_B"], [[1, "Gr\xfcn", 50, 0, 0]])
    chart = redavudeva.read(write_chart(text.encode("latin-1")))
    assert chart.names[0].encode("utf-8", "surrogateescape") == b"Gr\xfcn"


def test_example_chart_matches_the_tool(swatchlog):
    chart = redavudeva.read(EXAMPLES / "press_proof.it8")
    shown = swatchlog("patches", EXAMPLES / "press_proof.it8", "--spaces", "cmyk,lab", "--format", "tsv")
    header, *rows = [line.split("\t") for line in shown.stdout.splitlines()]
    column = {name.split(" ")[0]: i for i, name in enumerate(header)}

    def cells(*names):
        return [[float(row[column[name]]) for name in names] for row in rows]

    assert len(rows) == len(chart) == 48
    np.testing.assert_allclose(chart.cmyk, cells("CMYK_C", "CMYK_M", "CMYK_Y", "CMYK_K"), atol=0.005)
    np.testing.assert_allclose(chart.lab, cells("LAB_L", "LAB_A", "LAB_B"), atol=0.005)
    assert chart.names == [row[column["NAME"]] for row in rows]
    assert chart.sample_ids.tolist() == [row[column["SAMPLE_ID"]] for row in rows]
