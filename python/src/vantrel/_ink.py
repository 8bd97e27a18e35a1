"""What the program says of one patch, as objects."""

from dataclasses import dataclass
from typing import Any, Dict, Optional, Tuple

from ._result import Result
from ._results import Lab, PatchReport, frame


@dataclass(frozen=True)
class StatusReport:
    """The patch under one status: the `response` that reads it, its density, and those of all."""

    status: str
    response: Optional[str]
    density: Optional[float]
    densities: Dict[str, float]


@dataclass(frozen=True)
class IlluminantReport:
    """The patch under one illuminant and observer.

    Beside another patch also that one's colour, their ΔE00, and their metamerism beside the
    illuminant of the report: ΔE*ab under both together, and DIN 6172.
    """

    illuminant: str
    rgb: str
    lab: Lab
    lch: Lab
    against_rgb: Optional[str] = None
    against_lab: Optional[Lab] = None
    de00: Optional[float] = None
    metamerism: Optional[float] = None
    din6172: Optional[float] = None


@dataclass(frozen=True)
class Against(PatchReport):
    """The other patch, the ΔE00 to it, and what each band has to do with that.

    `a_weights` and `b_weights` are the shares of the bands in the difference along a* and b*, the
    largest 100; positive where the patch is redder, or yellower.
    """

    de00: float
    a_weights: Tuple[float, ...]
    b_weights: Tuple[float, ...]


@dataclass(frozen=True, repr=False)
class Ink(Result):
    """What `vantrel ink` says of one patch; print() shows it as the program does.

    Why it has no `whiteness` is said by `no_whiteness`.
    """

    file: str
    illuminant: str
    illuminant_by: str
    status: str
    warnings: Tuple[str, ...]
    paper: Optional[str]
    paper_chosen: str
    patch: PatchReport
    brightness: float
    whiteness: Optional[float]
    statuses: Tuple[StatusReport, ...]
    illuminants: Tuple[IlluminantReport, ...]
    no_whiteness: Optional[str] = None
    against: Optional[Against] = None

    def to_pandas(self) -> Any:
        """The answer as a table.

        Returns
        -------
        table : pandas.DataFrame
            A row for each status and its densities.

        Examples
        --------
        >>> vantrel.ink(vantrel.read("examples/two_ink_halftone.txt"), "Magenta 100").to_pandas().shape
        (10, 12)
        """
        return frame(
            {"status": one.status, "response": one.response, "density": one.density, **one.densities}
            for one in self.statuses
        )

    def __repr__(self) -> str:
        return f"<Ink {self.patch.name} of {self.file}, {self.status}, {self.illuminant}>"
