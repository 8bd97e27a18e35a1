"""What the program predicts of overprints and tints, as objects."""

from dataclasses import dataclass
from typing import Any, Optional, Tuple, Union

from ._result import MaybeNone, Result
from ._results import Lab, Refl, frame, lab_columns, plain, refl_columns


@dataclass(frozen=True)
class InkTint:
    """An ink, by its solid's patch, at a percentage."""

    name: str
    percent: int


@dataclass(frozen=True)
class Estimate:
    """What a model predicts."""

    rgb: str
    lab: Lab
    de00_to_measured: Optional[float]
    refl: Refl
    response: Optional[str]
    density: Optional[float]


@dataclass(frozen=True)
class Measured:
    """The patch of the sheet that holds the combination."""

    name: str
    rgb: str
    lab: Lab
    response: Optional[str]
    density: Optional[float]


MODELS = ("halftone", "film", "calibrated")


@dataclass(frozen=True)
class Prediction:
    """Inks in the order of printing by each model, None where it does not take them.

    `halftone` mixes ink and paper by area, `film` takes tints as thinner films, `calibrated` is
    fitted to the sheet and did without what is `lacking` there.
    """

    inks: Tuple[InkTint, ...]
    halftone: Optional[Estimate]
    film: Optional[Estimate]
    calibrated: Union[Estimate, MaybeNone]
    lacking: Tuple[str, ...]
    measured: Optional[Measured]


@dataclass(frozen=True)
class LeftOutError:
    """Of the calibrated model, ΔE00 on so many `patches`, each predicted without itself.

    Not among them are the overprints of `solids` alone, and those `passed_over` of very many.
    """

    patches: int
    mean: float
    p95: float
    max: float
    solids: int
    passed_over: int


@dataclass(frozen=True)
class Calibration:
    """How the calibrated model was fitted, `words` says it; `missing`: why there is none."""

    n: Optional[float]
    left_out_error: Optional[LeftOutError]
    missing: Optional[str]
    words: str


@dataclass(frozen=True, repr=False)
class Predictions(Result):
    """What `vantrel predict` says; `left_out` overprints could not be predicted."""

    file: str
    illuminant: str
    illuminant_by: str
    status: str
    warnings: Tuple[str, ...]
    paper: Optional[str]
    paper_chosen: str
    left_out: int
    calibration: Calibration
    predictions: Tuple[Prediction, ...]

    def to_pandas(self) -> Any:
        """The answer as a table.

        Returns
        -------
        table : pandas.DataFrame
            A row for each prediction and model.

        Examples
        --------
        >>> sheet = vantrel.read("examples/two_ink_halftone.txt")
        >>> vantrel.predict(sheet, inks={"CMYK_M": 40}).to_pandas().shape
        (3, 40)
        """
        return frame(
            {
                "inks": " + ".join(f"{ink.name} {ink.percent} %" for ink in prediction.inks),
                "model": model,
                **plain(estimate),
                **lab_columns(estimate.lab),
                **refl_columns(estimate.refl),
            }
            for prediction in self.predictions
            for model, estimate in ((model, getattr(prediction, model)) for model in MODELS)
            if estimate is not None
        )

    def __repr__(self) -> str:
        return f"<Predictions of {len(self.predictions)} combinations of {self.file}>"
