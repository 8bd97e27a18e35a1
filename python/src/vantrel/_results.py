"""What the commands of the program say of sheets, as objects: the numbers of its JSON."""

from dataclasses import dataclass, fields
from typing import Any, Dict, Optional, Tuple, Union

from ._result import MaybeNone, Result
from ._wavelengths import NM

Lab = Tuple[float, float, float]
Refl = Optional[Tuple[float, ...]]


def frame(rows: Any) -> Any:
    import pandas as pd

    return pd.DataFrame.from_records([*rows])


def plain(patch: Any, *left_out: str) -> Dict[str, Any]:
    """The fields of one patch as columns, but colours and spectra."""
    left = {"lab", "lch", "refl", "device", *left_out}
    return {f.name: getattr(patch, f.name) for f in fields(patch) if f.name not in left}


def lab_columns(lab: Optional[Lab], prefix: str = "") -> Dict[str, Any]:
    return {} if lab is None else {prefix + axis: value for axis, value in zip("Lab", lab)}


def refl_columns(refl: Refl) -> Dict[int, float]:
    return {} if refl is None else dict(zip(NM.astype(int).tolist(), refl))


@dataclass(frozen=True)
class PatchReport:
    """A patch of a report; what makes no sense for it is None.

    `response` reads it, `density` is in that, over the paper; `dot_area`, `dot_gain` and `sctv` (ISO
    20654) are those of tints of one ink, `print_contrast` of those from 75 to 80 %, `hue_error` and
    `grayness` of solids, `trap` of overprints of two solids, all in percent. `rgb` is the sRGB colour as "#rrggbb".
    """

    id: str
    name: str
    device: Dict[str, float]
    rgb: str
    lab: Lab
    lch: Lab
    de00_to_paper: Optional[float]
    response: Optional[str]
    response_id: Optional[int]
    density: Optional[float]
    dot_area: Optional[float]
    dot_gain: Optional[float]
    sctv: Optional[float]
    print_contrast: Optional[float]
    hue_error: Optional[float]
    grayness: Optional[float]
    trap: Optional[float]
    refl: Refl


@dataclass(frozen=True)
class Metamerism:
    """A second paper beside the first: ΔE00, ΔE*ab under two illuminants together, DIN 6172."""

    file: str
    paper: Optional[str]
    chosen: str
    de00: float
    illuminant: str
    sum: Optional[float]
    din6172: Optional[float]


@dataclass(frozen=True)
class PaperReport:
    """The paper: the patch `name` (None without one), how it was `chosen`, and what it measures."""

    name: Optional[str]
    chosen: str
    lab: Optional[Lab]
    brightness: Union[float, MaybeNone]
    whiteness: Optional[float]
    no_whiteness: Optional[str] = None
    metamerism: Optional[Metamerism] = None


@dataclass(frozen=True)
class ToneValue:
    """The mean of `patches` of one nominal value."""

    nominal: float
    dot_area: float
    dot_gain: float
    sctv: float
    patches: int


@dataclass(frozen=True)
class ToneCurve:
    """The tone values of an ink, a device field, over its solid, a patch.

    `tone_value` names the one that the program shows: "dot_area", or "sctv" of spot inks.
    """

    ink: str
    solid: str
    tone_value: str
    values: Tuple[ToneValue, ...]


@dataclass(frozen=True)
class Neutral:
    """A patch of the `scale` "CMY" (equal parts), "CMY grey" or "K", and its visual density."""

    scale: str
    nominal: float
    name: str
    density: float


@dataclass(frozen=True)
class ReportSource:
    """What the spectra were in the file."""

    first_nm: float
    last_nm: float
    step_nm: float
    bands: int
    averaged: bool
    interpolated: bool
    held: bool
    scaled_to_percent: bool
    scale_by: str
    condition: Optional[str]


@dataclass(frozen=True)
class Advice:
    """What to change at the press for a solid: its density, and ΔE00 before and after."""

    ink: str
    de00: float
    density_change: float
    de00_after: float
    words: str
    patch: str


@dataclass(frozen=True, repr=False)
class Report(Result):
    """What `vantrel report` says of a sheet; print() shows it as the program does."""

    file: str
    warnings: Tuple[str, ...]
    illuminant: str
    illuminant_by: str
    status: str
    n_factor: float
    inks: Tuple[str, ...]
    source: ReportSource
    paper: PaperReport
    tone_values: Tuple[ToneCurve, ...]
    greys: Tuple[Neutral, ...]
    patches: Tuple[PatchReport, ...]
    advice: Optional[Tuple[Advice, ...]] = None
    advice_from: Optional[str] = None

    @staticmethod
    def _body(document: Dict[str, Any]) -> Dict[str, Any]:
        body: Dict[str, Any] = document["sheets"][0]
        return body

    def to_pandas(self) -> Any:
        """The answer as a table.

        Returns
        -------
        table : pandas.DataFrame
            A row for each patch.

        Examples
        --------
        >>> vantrel.report(vantrel.read("examples/two_ink_halftone.txt")).to_pandas().shape
        (31, 52)
        """
        return frame(
            {
                **plain(p),
                **p.device,
                **lab_columns(p.lab),
                "C": p.lch[1],
                "h": p.lch[2],
                **refl_columns(p.refl),
            }
            for p in self.patches
        )

    def __repr__(self) -> str:
        return f"<Report of {self.file}: {len(self.patches)} patches, {self.illuminant}>"


@dataclass(frozen=True)
class Side:
    """One side of a pair: the mean of so many `repeats`, the farthest `spread` (ΔE00) from it."""

    id: str
    name: str
    rgb: str
    lab: Lab
    density: Optional[float]
    refl: Refl
    repeats: int
    spread: Optional[float]


@dataclass(frozen=True)
class CorrectedAim:
    """The aim moved to the sample's paper, and the differences from it by formula."""

    lab: Lab
    delta_e: Dict[str, Optional[float]]


@dataclass(frozen=True)
class Pair:
    """A patch beside its aim; `delta_e` holds the differences by formula."""

    name: str
    reference: Side
    sample: Side
    delta_e: Dict[str, Optional[float]]
    verbal: Optional[str]
    metamerism: Optional[float]
    din6172: Optional[float]
    response: Optional[str]
    density_difference: Optional[float]
    corrected: Optional[CorrectedAim] = None


@dataclass(frozen=True)
class Statistics:
    """Of all pairs: at least 95 % of them do not exceed `p95`; `max_patch` has the largest."""

    mean: Optional[float]
    p95: Optional[float]
    max: Optional[float]
    max_patch: str


@dataclass(frozen=True)
class Limit:
    """A limit of the tolerances and how it was judged; `margin` is limit less measured."""

    patches: str
    label: str
    group: str
    ink: Optional[str]
    nominal: Optional[float]
    formula: Optional[str]
    statistic: str
    aim: Optional[float]
    found: int
    judged: int
    measured: Optional[float]
    limit: float
    margin: Optional[float]
    verdict: str
    max_patch: Optional[str]
    note: Optional[str]


@dataclass(frozen=True)
class Corrected:
    """The judgement against aims that were moved to the sample's paper (ISO 13655)."""

    reference_paper: Lab
    sample_paper: Lab
    darkest: str
    verdict: Optional[str]
    limits: Tuple[Limit, ...]
    statistics: Dict[str, Statistics]


@dataclass(frozen=True)
class Compared:
    """A file of a comparison, its paper, and how that was chosen."""

    file: str
    paper: Optional[str]
    paper_chosen: str


@dataclass(frozen=True)
class Papers:
    """From the paper of the aims to that of the sample."""

    de00: float
    metamerism: Optional[float]


@dataclass(frozen=True)
class Judged:
    """How much was judged: `patches` of the sample by `aims` of the reference; `no_repeats` pairs rest
    on means of patches that are too far apart to be repeats."""

    patches: int
    of_patches: int
    aims: int
    of_aims: int
    strip: bool
    allow_missing: bool
    no_repeats: int


@dataclass(frozen=True)
class PairingTry:
    """What came of a key of pairing that was not taken."""

    by: str
    aims: int
    patches: int
    disagreeing: int


@dataclass(frozen=True)
class Means:
    """So many `patches` are means of repeats; the `widest` has so many, with this `spread`."""

    patches: int
    widest: str
    repeats: int
    spread: float


@dataclass(frozen=True)
class ToneStep:
    """The dot areas of tints of `ink`, in percent, of aim and sample; of spot inks by ISO 20654 too.

    They are the means of so many `patches` of the sample.
    """

    ink: str
    nominal: float
    reference: Optional[float]
    sample: Optional[float]
    reference_sctv: Optional[float]
    sample_sctv: Optional[float]
    patches: int


@dataclass(frozen=True)
class GreyStep:
    """A patch of the `scale` "CMY" (equal parts), "CMY grey" or "K" beside its aim; visual densities."""

    scale: str
    nominal: float
    name: str
    delta_ch: float
    delta_l: float
    reference_density: Optional[float]
    density: Optional[float]


@dataclass(frozen=True, repr=False)
class Comparison(Result):
    """What `vantrel compare` says of a sheet beside its aims.

    `verdict` is "passed", "failed" or "incomplete", or None where no tolerance is given; `says` is
    the same in a sentence.
    """

    verdict: Optional[str]
    says: str
    passed: Optional[bool]
    judged: Judged
    warnings: Tuple[str, ...]
    reference: Compared
    sample: Compared
    papers: Optional[Papers]
    illuminant: str
    illuminant_by: str
    second_illuminant: str
    status: str
    paired_by: str
    passed_over: Tuple[PairingTry, ...]
    formulas: Tuple[str, ...]
    labels: Dict[str, str]
    weights: Dict[str, Tuple[float, ...]]
    tolerance: Optional[float]
    tolerances: Optional[str]
    limits: Tuple[Limit, ...]
    corrected: Optional[Corrected]
    statistics: Dict[str, Statistics]
    means: Dict[str, Optional[Means]]
    tone_values: Tuple[ToneStep, ...]
    greys: Tuple[GreyStep, ...]
    worst: Tuple[int, ...]
    unpaired: Dict[str, Tuple[str, ...]]
    pairs: Tuple[Pair, ...]
    advice: Optional[Tuple[Advice, ...]] = None
    advice_from: Optional[str] = None

    def to_pandas(self) -> Any:
        """The answer as a table.

        Returns
        -------
        table : pandas.DataFrame
            A row for each pair.

        Examples
        --------
        >>> import dataclasses
        >>> aims = vantrel.read("examples/two_ink_halftone.txt")
        >>> sheet = dataclasses.replace(aims, spectra=0.98 * aims.spectra, file="sheet")
        >>> vantrel.compare(aims, sheet).to_pandas().shape
        (31, 44)
        """
        return frame(
            {
                **plain(p, "reference", "sample", "delta_e", "corrected"),
                **p.delta_e,
                **lab_columns(p.reference.lab, "reference_"),
                **lab_columns(p.sample.lab),
                **{f"corrected_{k}": v for k, v in (p.corrected.delta_e if p.corrected else {}).items()},
                **refl_columns(p.sample.refl),
            }
            for p in self.pairs
        )

    def __repr__(self) -> str:
        return f"<Comparison of {self.sample.file} with {self.reference.file}: {self.says}>"
