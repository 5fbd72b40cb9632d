"""Colour measurement charts in the IT8.7 / CGATS.17 text format as NumPy arrays.

``read()`` gives a :class:`Chart` whose colour spaces are float arrays with one
row per patch (NaN where a patch lacks a value); ``Chart.from_arrays()`` and
``Chart.write()`` make new chart files; ``merge()`` and ``write_target()`` run
the writers that start from an existing file; ``delta_e()`` computes CIEDE2000
and CIE76 colour differences. Failures raise :class:`ChartError`.
"""

from ._redavudeva import Chart, ChartError, Table, delta_e, merge, read, write_target

__all__ = ["Chart", "ChartError", "Table", "delta_e", "merge", "read", "write_target"]
__version__ = "0.1.0"
