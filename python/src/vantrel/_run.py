"""What the program says of a press run, as objects."""

from dataclasses import dataclass
from typing import Any, Dict, Optional, Tuple

from ._result import Result
from ._results import Advice, Judged, Limit, frame


@dataclass(frozen=True)
class RunLimit(Limit):
    """A limit over a run, as the `sheet` (from 1) that was farthest from holding it."""

    sheet: int
    first_failed: Optional[int]


@dataclass(frozen=True)
class RunSheet:
    """A sheet of a run; `verdict` is None where no limits are set."""

    file: str
    created: str
    verdict: Optional[str]
    judged: Judged
    zones: Tuple[int, ...]


@dataclass(frozen=True)
class Series:
    """A reading over the sheets of a run, None where one lacks it; sheets count from 1.

    `low` and `high` are its limits about the `aim`; `slope` a sheet, with half of its 95 % interval;
    `values` that of the mean of the zones, `lowest` to `highest` and `spread` (standard deviation)
    over them. `odd_zones` are unlike the others, by so much;
    `zone_outliers`, each a `sheet`, `zone` and `difference`, unlike the same zone on other sheets.
    """

    title: str
    attribute: str
    subject: str
    nominal: float
    sctv: bool
    decimals: int
    aim: Optional[float]
    low: Optional[float]
    high: Optional[float]
    mean: float
    deviation: Optional[float]
    slope: Optional[float]
    slope_uncertainty: Optional[float]
    first_outside: Optional[int]
    leaves_at: Optional[int]
    outliers: Tuple[int, ...]
    odd_zones: Dict[str, float]
    zone_outliers: Tuple[Dict[str, float], ...]
    values: Tuple[Optional[float], ...]
    lowest: Tuple[Optional[float], ...]
    highest: Tuple[Optional[float], ...]
    spread: Tuple[Optional[float], ...]
    zones: Tuple[Optional[Dict[str, float]], ...]


@dataclass(frozen=True, repr=False)
class Run(Result):
    """What `vantrel run` says of a press run; `findings` say in sentences what to look at."""

    aims: str
    illuminant: str
    illuminant_by: str
    status: str
    job: str
    instrument: str
    condition: str
    verdict: Optional[str]
    says: str
    findings: Tuple[str, ...]
    warnings: Tuple[str, ...]
    by_date: bool
    sheets: Tuple[RunSheet, ...]
    unread: Tuple[str, ...]
    gaps: Tuple[str, ...]
    tolerances: Optional[str]
    limits: Tuple[RunLimit, ...]
    series: Tuple[Series, ...]
    advice: Tuple[Advice, ...] = ()
    advice_from: Optional[str] = None

    def to_pandas(self) -> Any:
        """The answer as a table.

        Returns
        -------
        table : pandas.DataFrame
            A row for each sheet and a column for each reading.

        Examples
        --------
        >>> from dataclasses import replace
        >>> aims = vantrel.read("examples/two_ink_halftone.txt")
        >>> dates = [replace(aims.origin, created=f"2026-03-{day}") for day in range(11, 16)]
        >>> darker = [aims.spectra * np.linspace(1 - i / 99, 1, 31) for i in range(1, 6)]
        >>> sheets = [replace(aims, spectra=s, origin=date) for s, date in zip(darker, dates)]
        >>> vantrel.run(sheets, aims).to_pandas().shape
        (5, 29)
        """
        columns = {one.title: one.values for one in self.series}
        files = [sheet.file for sheet in self.sheets]
        return frame(
            {"file": file, **{title: values[i] for title, values in columns.items()}}
            for i, file in enumerate(files)
        )

    def __repr__(self) -> str:
        return f"<Run of {len(self.sheets)} sheets, aims {self.aims}: {self.says}>"
