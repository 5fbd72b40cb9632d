"""Type stubs of the redavudeva extension module."""

import os
from typing import Literal, Mapping, Optional, Sequence, Union, overload

import numpy as np
import numpy.typing as npt

_Path = Union[str, bytes, "os.PathLike[str]", "os.PathLike[bytes]"]
_FloatArray = npt.NDArray[np.float64]
_ArrayLike = npt.ArrayLike

class ChartError(Exception):
    """A chart file could not be read or written; str() is the tool's message."""

    code: Optional[int]
    """The library's result code, or None when the failure is not one."""
    path: Optional[str]
    """The file the failure is about, or None."""
    table: Optional[int]
    """The number of the table read (1 for the first) in a file of several, else None."""
    line: Optional[int]
    """The line of the file the failure points at, or None."""

class Table:
    """One table of a chart file: a header, a data format and a data block."""

    number: int
    """The table's number in its file, 1 for the first (read(table=...))."""
    first_line: int
    """The table's first line in the file (counted from 1)."""
    last_line: int
    """The table's last line: its END_DATA line, or the file's end."""
    @property
    def data_line(self) -> Optional[int]:
        """The line of its BEGIN_DATA, or None when it has no data block."""
    rows: int
    """The number of data rows in its data block."""
    fields: tuple[str, ...]
    """The data format's field names, upper case, in column order."""
    identification: str
    """The word alone on the table's first line ("CGATS.17", "CTI3" ...), or ""."""

class Chart:
    """One chart: its patches in sample-number order and its header keywords."""

    @property
    def path(self) -> Optional[str]:
        """The file the chart was read from, or None for a chart built from arrays."""
    @property
    def tables(self) -> tuple[Table, ...]:
        """Every table of the file read; empty for a chart built from arrays."""
    @property
    def table(self) -> Optional[int]:
        """The number of the table this chart holds, None for a chart built from arrays."""
    @property
    def sample_numbers(self) -> npt.NDArray[np.int64]:
        """Sample numbers 1 ... N of the patches, in data-row order."""
    @property
    def sample_ids(self) -> npt.NDArray[np.str_]:
        """The file's SAMPLE_ID text of each patch; the sample numbers as text when it has none."""
    @property
    def names(self) -> list[str]:
        """Sample names without surrounding double quotes; empty strings when none."""
    @property
    def keywords(self) -> dict[str, str]:
        """Header keywords as the file has them, text values in double quotes."""
    @property
    def device(self) -> str:
        """Name of the device colour space, as 'swatchlog info' reports it."""
    @property
    def cmyk(self) -> _FloatArray:
        """CMYK in percent, (patches, 4); NaN unless the file has CMYK fields."""
    @property
    def rgb(self) -> _FloatArray:
        """RGB 0-255, (patches, 3)."""
    @property
    def xyz(self) -> _FloatArray:
        """CIE XYZ with Y = 100 for the perfect white, (patches, 3)."""
    @property
    def lab(self) -> _FloatArray:
        """CIE L*a*b*, (patches, 3)."""
    @property
    def density(self) -> _FloatArray:
        """Red, green, blue and visual densities, (patches, 4)."""
    @property
    def ncolor(self) -> _FloatArray:
        """n-colour channels in percent, (patches, len(ncolor_names))."""
    @property
    def ncolor_names(self) -> list[str]:
        """Field names of the n-colour channels, in channel order."""
    @property
    def wavelengths(self) -> _FloatArray:
        """Wavelengths of the spectral columns in nm, ascending."""
    @property
    def spectra(self) -> _FloatArray:
        """Reflectance factors, (patches, len(wavelengths))."""
    @property
    def derived(self) -> dict[str, npt.NDArray[np.bool_]]:
        """Per colour space, True where the library worked the value out."""
    def __len__(self) -> int:
        """The number of patches."""
    @staticmethod
    def from_arrays(
        *,
        names: Optional[Sequence[str]] = None,
        cmyk: Optional[_ArrayLike] = None,
        rgb: Optional[_ArrayLike] = None,
        xyz: Optional[_ArrayLike] = None,
        lab: Optional[_ArrayLike] = None,
        ncolor: Optional[_ArrayLike] = None,
        ncolor_names: Optional[Sequence[str]] = None,
        spectra: Optional[_ArrayLike] = None,
        wavelengths: Optional[_ArrayLike] = None,
        keywords: Optional[Mapping[str, Union[str, int, float]]] = None,
    ) -> "Chart":
        """Build a chart from arrays with one row per patch."""
    def write(self, path: _Path) -> None:
        """Write the chart as a new CGATS.17 file through the new-file writer."""

def read(path: _Path, table: Optional[int] = None) -> Chart:
    """Read table `table` (1 for the first; default: the first with data rows) of the chart file at `path`."""

def merge(
    target: _Path,
    measured: _Path,
    output: _Path,
    *,
    append_missing: bool = False,
    exact: bool = False,
    by: Literal["auto", "id", "name", "position"] = "auto",
    allow_unpaired: bool = False,
    device_tolerance: float = 1.0,
    target_table: Optional[int] = None,
    measured_table: Optional[int] = None,
) -> None:
    """Put the measurements of `measured` into the target file, written to `output`."""

def write_target(chart: _Path, output: _Path, *, table: Optional[int] = None, force: bool = False) -> None:
    """Write `chart` reduced to its clean and white patches to `output`."""

@overload
def delta_e(lab1: Sequence[float], lab2: Sequence[float], method: str = "CIE2000") -> float:
    """Colour difference (CIEDE2000 or CIE76) of two single L*a*b* colours."""
@overload
def delta_e(lab1: _ArrayLike, lab2: _ArrayLike, method: str = "CIE2000") -> _FloatArray:
    """Colour differences (CIEDE2000 or CIE76) between L*a*b* arrays, broadcast."""
