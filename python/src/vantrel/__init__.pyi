"""Types of the package, written by stubs.py.

Results are arrays of the kind that was handed in, NumPy scalars for single rows; with `ok=True` a
tuple that ends with the flags.
"""

from contextlib import AbstractContextManager
from typing import Annotated, Any, Literal, Optional, Protocol, Sequence, TypeVar, Union, overload

import numpy as np
from numpy.typing import ArrayLike, NDArray

from . import plot as plot
from ._enums import IllumObs as IllumObs, Response as Response, Status as Status
from ._ink import Ink as Ink
from ._judge import compare as compare, ink as ink, predict as predict, report as report, run as run
from ._predictions import Predictions as Predictions
from ._results import Comparison as Comparison, Report as Report
from ._run import Run as Run
from ._sheet import Origin as Origin, Sheet as Sheet, Source as Source, read as read, reads as reads

class _SupportsArray(Protocol):
    def __array__(self) -> Any: ...

class _Other(Protocol):  # an array of Dask or xarray
    def __dask_graph__(self) -> Any: ...

_T = TypeVar("_T")
_Flags = Annotated[NDArray[np.bool_], "or a flag, for single rows"]
_OneOrMore = Union[_T, int, Sequence[Union[_T, int, Sequence[Union[_T, int]]]], _SupportsArray]
_Spectra = ArrayLike
_Colours = ArrayLike
_Inks = ArrayLike
_Numbers = ArrayLike
_Integers = ArrayLike
_OptionalSpectra = Optional[ArrayLike]
_OptionalTargets = Optional[ArrayLike]

_Illuminant = _OneOrMore[
    Literal[
        "A_2DEG", "A_10DEG", "C_2DEG", "C_10DEG", "D50_2DEG", "D50_10DEG", "D65_2DEG", "D65_10DEG",
        "F2_2DEG", "F2_10DEG", "F7_2DEG", "F7_10DEG", "F11_2DEG", "F11_10DEG", "F12_2DEG",
        "F12_10DEG", "D75_2DEG", "D75_10DEG"
    ]
]
_WhitenessIlluminant = _OneOrMore[
    Literal[
        "C_2DEG", "C_10DEG", "D50_2DEG", "D50_10DEG", "D65_2DEG", "D65_10DEG"
    ]
]
_StatusName = _OneOrMore[
    Literal[
        "A_STATUS", "E_STATUS", "I_STATUS", "T_STATUS", "SPECTRAL_STATUS", "SPECTRALX_STATUS",
        "HIFI_STATUS", "HEXACHROME_STATUS", "CCR1_STATUS", "CCR2_STATUS", "A", "E", "I", "T",
        "SPECTRAL", "SPECTRALX", "HIFI", "HEXACHROME", "CCR1", "CCR2"
    ]
]
_CCRStatus = _OneOrMore[
    Literal[
        "CCR1_STATUS", "CCR2_STATUS", "CCR1", "CCR2"
    ]
]
_HueStatus = _OneOrMore[
    Literal[
        "A_STATUS", "E_STATUS", "I_STATUS", "T_STATUS", "SPECTRAL_STATUS", "HIFI_STATUS",
        "HEXACHROME_STATUS", "CCR1_STATUS", "CCR2_STATUS", "A", "E", "I", "T", "SPECTRAL", "HIFI",
        "HEXACHROME", "CCR1", "CCR2"
    ]
]
_ResponseName = _OneOrMore[
    Literal[
        "VISUAL_RESPONSE", "RED_RESPONSE", "GREEN_RESPONSE", "BLUE_RESPONSE", "HIFI1_RESPONSE",
        "HIFI2_RESPONSE", "HIFI3_RESPONSE", "HEXACHROME1_RESPONSE", "HEXACHROME2_RESPONSE",
        "VISUAL", "RED", "GREEN", "BLUE", "HIFI1", "HIFI2", "HIFI3", "HEXACHROME1", "HEXACHROME2"
    ]
]
_InkResponse = _OneOrMore[
    Literal[
        "RED_RESPONSE", "GREEN_RESPONSE", "BLUE_RESPONSE", "HIFI1_RESPONSE", "HIFI2_RESPONSE",
        "HIFI3_RESPONSE", "HEXACHROME1_RESPONSE", "HEXACHROME2_RESPONSE", "RED", "GREEN", "BLUE",
        "HIFI1", "HIFI2", "HIFI3", "HEXACHROME1", "HEXACHROME2"
    ]
]
_Reading = _OneOrMore[
    Literal[
        "VISUAL_RESPONSE", "RED_RESPONSE", "GREEN_RESPONSE", "BLUE_RESPONSE", "HIFI1_RESPONSE",
        "HIFI2_RESPONSE", "HIFI3_RESPONSE", "HEXACHROME1_RESPONSE", "HEXACHROME2_RESPONSE",
        "VISUAL", "RED", "GREEN", "BLUE", "HIFI1", "HIFI2", "HIFI3", "HEXACHROME1", "HEXACHROME2"
    ]
]
_Row = NDArray[np.float64]
__version__: str
ufuncs: Any
den_weight: NDArray[np.int64]

__all__ = [
    "CIEDE2000", "Comparison", "IllumObs", "Ink", "Origin", "Predictions", "Report", "Response",
    "Run", "Sheet", "Source", "Status", "adjust_for_paper_refls", "calc_labch",
    "calculate_ccr_densities", "calculate_special_density", "calculate_spectral_density",
    "calculate_spectralx_density", "calculate_tint_color", "choose_bp_wavelen",
    "cie_yxy_to_white_e313_98", "cielab_to_cielch", "cielab_to_cielch_ex", "cielch_to_cielab",
    "cielch_to_de94", "color_at_equivalent_density", "combine_3_ink_colors",
    "combine_3_ink_colors_ex", "combine_ink_colors", "combine_ink_colors_ex", "compare",
    "den_weight", "density_from_dot_area", "density_ratio", "density_to_dot_area",
    "density_to_hue_gray", "density_to_integrated_refl", "density_to_print_contrast",
    "density_to_trap", "determine_density_response", "estimate_color", "estimate_refls",
    "estimate_refls_ex", "estimate_refls_ex_for_best_visual_color",
    "estimate_refls_for_best_visual_color", "estimate_refls_for_thickness",
    "estimate_refls_for_tint_color", "estimate_refls_for_tint_color_for_best_visual_color",
    "estimate_tint_color", "find_density_max", "find_density_min", "find_max_density_points",
    "get_achromatic_constants", "get_hexachrome_constants", "get_hifi_constants",
    "get_normalized_density_weights", "get_num_illuminant_observers", "get_num_responses",
    "get_num_status_responses", "get_num_statuses", "get_spectralx_constants", "ink",
    "is_chromatic", "is_chromatic_lch", "lab_to_de2000", "lab_to_de2000_ex", "lab_to_de94",
    "lab_to_de_cmc", "lab_to_de_lab", "lab_to_dh", "lab_to_xyz", "metamerism", "plot",
    "pol_determine_density_response", "pol_refl_adjust", "pol_refl_auto_adjust",
    "pol_refl_to_densities", "pol_refl_to_density", "pol_refl_to_dot_area",
    "pol_refl_to_dot_gain", "pol_refl_to_hue_gray", "pol_refl_to_print_contrast",
    "pol_refl_to_trap", "predict", "read", "reads", "refl_to_ab_error_weights",
    "refl_to_brightness", "refl_to_cie_yxy", "refl_to_cielab", "refl_to_cielch",
    "refl_to_cieluv", "refl_to_densities", "refl_to_densities_no_paper", "refl_to_density",
    "refl_to_din6172", "refl_to_dot_area", "refl_to_dot_gain", "refl_to_hue_gray",
    "refl_to_hunter_lab", "refl_to_pol_intercept", "refl_to_print_contrast",
    "refl_to_refl_density", "refl_to_rgb", "refl_to_trap", "refl_to_white_e313_98",
    "refl_to_xyz", "refl_to_xyzs", "report", "resample", "run", "saunderson",
    "set_achromatic_constants", "set_hexachrome_constants", "set_hifi_constants",
    "set_spectralx_constants", "settings", "ufuncs", "un_saunderson", "unpack_rgb",
    "verbal_color_difference", "xyz_to_cie_yxy", "xyz_to_cielab", "xyz_to_cielch",
    "xyz_to_cieluv", "xyz_to_rgb", "xyz_to_xyz"
]

@overload
def adjust_for_paper_refls(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def adjust_for_paper_refls(
    spectra: _Spectra, paper: _Spectra, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def adjust_for_paper_refls(
    spectra: _Spectra, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def calc_labch(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def calc_labch(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 5)']: ...
@overload
def calc_labch(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 5)'], _Flags]: ...
@overload
def calculate_ccr_densities(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def calculate_ccr_densities(
    spectra: _Spectra, paper: _OptionalSpectra, status: _CCRStatus, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 9)']: ...
@overload
def calculate_ccr_densities(
    spectra: _Spectra, paper: _OptionalSpectra, status: _CCRStatus, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 9)'], _Flags]: ...
@overload
def calculate_special_density(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def calculate_special_density(
    spectra: _Spectra, centre: _Integers, weights: _Numbers, *, out: Any = None
) -> Annotated[Any, 'float64 or array']: ...
@overload
def calculate_spectral_density(refl: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def calculate_spectral_density(
    refl: _Numbers, *, out: Any = None
) -> Annotated[Any, 'float64 or array']: ...
@overload
def calculate_spectralx_density(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def calculate_spectralx_density(
    spectra: _Spectra, paper: _OptionalSpectra, request: _Integers, *, out: Any = None, ok:
    Literal[False] = False
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'int32 or array']]: ...
@overload
def calculate_spectralx_density(
    spectra: _Spectra, paper: _OptionalSpectra, request: _Integers, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'int32 or array'], _Flags]: ...
@overload
def calculate_tint_color(ink: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def calculate_tint_color(
    ink: _Spectra, paper: _Spectra, percent: _Integers, illum_obs: _Illuminant = 'D50_2DEG', *,
    out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'uint32 or array']: ...
@overload
def calculate_tint_color(
    ink: _Spectra, paper: _Spectra, percent: _Integers, illum_obs: _Illuminant = 'D50_2DEG', *,
    out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'uint32 or array'], _Flags]: ...
@overload
def choose_bp_wavelen(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def choose_bp_wavelen(
    spectra: _Spectra, bands: _Integers, count: _Integers, *, out: Any = None
) -> Annotated[Any, 'int32 or array']: ...
@overload
def cie_yxy_to_white_e313_98(Yxy: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def cie_yxy_to_white_e313_98(
    Yxy: _Colours, illum_obs: _WhitenessIlluminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def cie_yxy_to_white_e313_98(
    Yxy: _Colours, illum_obs: _WhitenessIlluminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def cielab_to_cielch(lab: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def cielab_to_cielch(
    lab: _Colours, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def cielab_to_cielch(
    lab: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def cielab_to_cielch_ex(lab: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def cielab_to_cielch_ex(
    lab: _Colours, round: _Integers, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def cielab_to_cielch_ex(
    lab: _Colours, round: _Integers, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def cielch_to_cielab(lch: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def cielch_to_cielab(
    lch: _Colours, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def cielch_to_cielab(
    lch: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def cielch_to_de94(sample: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def cielch_to_de94(
    sample: _Colours, reference: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, *, out: Any =
    None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def cielch_to_de94(
    sample: _Colours, reference: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, *, out: Any =
    None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def color_at_equivalent_density(reference: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def color_at_equivalent_density(
    reference: _Spectra, sample: _Spectra, status: _StatusName, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def color_at_equivalent_density(
    reference: _Spectra, sample: _Spectra, status: _StatusName, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def combine_3_ink_colors(spectra1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def combine_3_ink_colors(
    spectra1: _Spectra, spectra2: _Spectra, spectra3: _Spectra, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def combine_3_ink_colors(
    spectra1: _Spectra, spectra2: _Spectra, spectra3: _Spectra, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def combine_3_ink_colors_ex(lab1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def combine_3_ink_colors_ex(
    lab1: _Colours, lab2: _Colours, lab3: _Colours, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def combine_3_ink_colors_ex(
    lab1: _Colours, lab2: _Colours, lab3: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def combine_ink_colors(spectra1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def combine_ink_colors(
    spectra1: _Spectra, spectra2: _Spectra, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def combine_ink_colors(
    spectra1: _Spectra, spectra2: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def combine_ink_colors_ex(lab1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def combine_ink_colors_ex(
    lab1: _Colours, lab2: _Colours, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def combine_ink_colors_ex(
    lab1: _Colours, lab2: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def density_from_dot_area(solid_density: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def density_from_dot_area(
    solid_density: _Numbers, dot_area: _Numbers, n_factor: _Numbers = 1, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def density_from_dot_area(
    solid_density: _Numbers, dot_area: _Numbers, n_factor: _Numbers = 1, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def density_ratio(reference: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def density_ratio(
    reference: _Spectra, sample: _Spectra, status: _StatusName, *, out: Any = None
) -> Annotated[Any, 'float64 or array']: ...
@overload
def density_to_dot_area(solid_density: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def density_to_dot_area(
    solid_density: _Numbers, tint_density: _Numbers, n_factor: _Numbers = 1, *, out: Any = None,
    ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def density_to_dot_area(
    solid_density: _Numbers, tint_density: _Numbers, n_factor: _Numbers = 1, *, out: Any = None,
    ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def density_to_hue_gray(red_density: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def density_to_hue_gray(
    red_density: _Numbers, green_density: _Numbers, blue_density: _Numbers, *, out: Any = None,
    ok: Literal[False] = False
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array']]: ...
@overload
def density_to_hue_gray(
    red_density: _Numbers, green_density: _Numbers, blue_density: _Numbers, *, out: Any = None,
    ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def density_to_integrated_refl(density: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def density_to_integrated_refl(
    density: _Numbers, status: _HueStatus, response: _InkResponse, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def density_to_integrated_refl(
    density: _Numbers, status: _HueStatus, response: _InkResponse, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def density_to_print_contrast(solid_density: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def density_to_print_contrast(
    solid_density: _Numbers, tint_density: _Numbers, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def density_to_print_contrast(
    solid_density: _Numbers, tint_density: _Numbers, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def density_to_trap(overprint_density: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def density_to_trap(
    overprint_density: _Numbers, second_density: _Numbers, first_density: _Numbers, *, out: Any
    = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def density_to_trap(
    overprint_density: _Numbers, second_density: _Numbers, first_density: _Numbers, *, out: Any
    = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def determine_density_response(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def determine_density_response(
    spectra: _Spectra, status: _StatusName, paper: _OptionalSpectra = None, *, out: Any = None
) -> Annotated[Any, 'int32 or array']: ...
@overload
def estimate_color(inks: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_color(
    inks: _Inks, percent: _Integers, paper: _Colours, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def estimate_color(
    inks: _Inks, percent: _Integers, paper: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def estimate_refls(inks: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_refls(
    inks: _Inks, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def estimate_refls(
    inks: _Inks, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def estimate_refls_ex(n: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_refls_ex(
    n: _Integers, first: _Spectra, second: _OptionalSpectra, third: _OptionalSpectra, percent:
    _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def estimate_refls_ex(
    n: _Integers, first: _Spectra, second: _OptionalSpectra, third: _OptionalSpectra, percent:
    _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def estimate_refls_ex_for_best_visual_color(n: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_refls_ex_for_best_visual_color(
    n: _Integers, first: _Spectra, second: _OptionalSpectra, third: _OptionalSpectra, percent:
    _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def estimate_refls_ex_for_best_visual_color(
    n: _Integers, first: _Spectra, second: _OptionalSpectra, third: _OptionalSpectra, percent:
    _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def estimate_refls_for_best_visual_color(inks: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_refls_for_best_visual_color(
    inks: _Inks, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def estimate_refls_for_best_visual_color(
    inks: _Inks, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def estimate_refls_for_thickness(ink: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_refls_for_thickness(
    ink: _Spectra, thickness: _Numbers, paper: _Spectra, *, out: Any = None, ok: Literal[False]
    = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def estimate_refls_for_thickness(
    ink: _Spectra, thickness: _Numbers, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def estimate_refls_for_tint_color(ink: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_refls_for_tint_color(
    ink: _Spectra, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def estimate_refls_for_tint_color(
    ink: _Spectra, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def estimate_refls_for_tint_color_for_best_visual_color(
    ink: _Other, *others: Any, **named: Any
) -> Any: ...
@overload
def estimate_refls_for_tint_color_for_best_visual_color(
    ink: _Spectra, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def estimate_refls_for_tint_color_for_best_visual_color(
    ink: _Spectra, percent: _Integers, paper: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def estimate_tint_color(ink: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def estimate_tint_color(
    ink: _Colours, percent: _Integers, paper: _Colours, *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def estimate_tint_color(
    ink: _Colours, percent: _Integers, paper: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def find_density_max(densities: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def find_density_max(
    densities: _Numbers, include_visual: _Integers, *, out: Any = None, ok: Literal[False] =
    False
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'int32 or array']]: ...
@overload
def find_density_max(
    densities: _Numbers, include_visual: _Integers, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'int32 or array'], _Flags]: ...
@overload
def find_density_min(densities: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def find_density_min(
    densities: _Numbers, include_visual: _Integers, *, out: Any = None, ok: Literal[False] =
    False
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'int32 or array']]: ...
@overload
def find_density_min(
    densities: _Numbers, include_visual: _Integers, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'int32 or array'], _Flags]: ...
@overload
def find_max_density_points(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def find_max_density_points(
    spectra: _Spectra, *, out: Any = None, ok: Literal[False] = False
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.integer[Any]], '(..., 31)'], Annotated[Any, 'int32 or array']]: ...
@overload
def find_max_density_points(
    spectra: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.integer[Any]], '(..., 31)'], Annotated[Any, 'int32 or array'], _Flags]: ...
@overload
def get_normalized_density_weights(status: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def get_normalized_density_weights(
    status: _StatusName, response: _ResponseName, *, out: Any = None, ok: Literal[False] = False
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array']]: ...
@overload
def get_normalized_density_weights(
    status: _StatusName, response: _ResponseName, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def get_num_status_responses(status: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def get_num_status_responses(
    status: _StatusName, *, out: Any = None
) -> Annotated[Any, 'int32 or array']: ...
@overload
def is_chromatic(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def is_chromatic(
    spectra: _Spectra, illum_obs: _Illuminant = 'D65_10DEG', *, out: Any = None
) -> Annotated[Any, 'bool or array']: ...
@overload
def is_chromatic_lch(lch: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def is_chromatic_lch(lch: _Colours, *, out: Any = None) -> Annotated[Any, 'bool or array']: ...
@overload
def lab_to_de2000(lab1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def lab_to_de2000(
    lab1: _Colours, lab2: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def lab_to_de2000(
    lab1: _Colours, lab2: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def lab_to_de2000_ex(lab1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def lab_to_de2000_ex(
    lab1: _Colours, lab2: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, kH: _Numbers = 1, *,
    out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def lab_to_de2000_ex(
    lab1: _Colours, lab2: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, kH: _Numbers = 1, *,
    out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def lab_to_de94(sample: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def lab_to_de94(
    sample: _Colours, reference: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, *, out: Any =
    None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def lab_to_de94(
    sample: _Colours, reference: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, *, out: Any =
    None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def lab_to_de_cmc(sample: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def lab_to_de_cmc(
    sample: _Colours, reference: _Colours, l: _Numbers = 2, c: _Numbers = 1, rounded: _Integers
    = True, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def lab_to_de_cmc(
    sample: _Colours, reference: _Colours, l: _Numbers = 2, c: _Numbers = 1, rounded: _Integers
    = True, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def lab_to_de_lab(lab1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def lab_to_de_lab(
    lab1: _Colours, lab2: _Colours, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def lab_to_de_lab(
    lab1: _Colours, lab2: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def lab_to_dh(lab1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def lab_to_dh(
    lab1: _Colours, lab2: _Colours, rounded: _Integers = True, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def lab_to_dh(
    lab1: _Colours, lab2: _Colours, rounded: _Integers = True, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def lab_to_xyz(lab: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def lab_to_xyz(
    lab: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def lab_to_xyz(
    lab: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def metamerism(standard: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def metamerism(
    standard: _Spectra, sample: _Spectra, illum_obs1: _Illuminant, illum_obs2: _Illuminant, *,
    out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def metamerism(
    standard: _Spectra, sample: _Spectra, illum_obs1: _Illuminant, illum_obs2: _Illuminant, *,
    out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def pol_determine_density_response(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_determine_density_response(
    spectra: _Spectra, targets: _Numbers, status: _StatusName, paper: _OptionalSpectra,
    paper_targets: _OptionalTargets, weights: _Numbers, *, out: Any = None
) -> Annotated[Any, 'int32 or array']: ...
@overload
def pol_refl_adjust(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_adjust(
    spectra: _Spectra, response: _ResponseName, targets: _Numbers, weights: _Numbers, *, out:
    Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def pol_refl_adjust(
    spectra: _Spectra, response: _ResponseName, targets: _Numbers, weights: _Numbers, *, out:
    Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def pol_refl_auto_adjust(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_auto_adjust(
    spectra: _Spectra, targets: _Numbers, weights: _Numbers, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 31)']: ...
@overload
def pol_refl_auto_adjust(
    spectra: _Spectra, targets: _Numbers, weights: _Numbers, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def pol_refl_to_densities(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_to_densities(
    spectra: _Spectra, targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _StatusName, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 9)']: ...
@overload
def pol_refl_to_densities(
    spectra: _Spectra, targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _StatusName, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 9)'], _Flags]: ...
@overload
def pol_refl_to_density(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_to_density(
    spectra: _Spectra, targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _StatusName, response: _Reading, *, out: Any =
    None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def pol_refl_to_density(
    spectra: _Spectra, targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _StatusName, response: _Reading, *, out: Any =
    None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def pol_refl_to_dot_area(solid: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_to_dot_area(
    solid: _Spectra, solid_targets: _Numbers, tint: _Spectra, tint_targets: _Numbers, paper:
    _OptionalSpectra, paper_targets: _OptionalTargets, weights: _Numbers, status: _StatusName,
    response: _Reading, n_factor: _Numbers = 1, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def pol_refl_to_dot_area(
    solid: _Spectra, solid_targets: _Numbers, tint: _Spectra, tint_targets: _Numbers, paper:
    _OptionalSpectra, paper_targets: _OptionalTargets, weights: _Numbers, status: _StatusName,
    response: _Reading, n_factor: _Numbers = 1, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def pol_refl_to_dot_gain(solid: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_to_dot_gain(
    solid: _Spectra, solid_targets: _Numbers, tint: _Spectra, tint_targets: _Numbers, paper:
    _OptionalSpectra, paper_targets: _OptionalTargets, weights: _Numbers, status: _StatusName,
    response: _Reading, n_factor: _Numbers, nominal_dot_area: _Integers, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def pol_refl_to_dot_gain(
    solid: _Spectra, solid_targets: _Numbers, tint: _Spectra, tint_targets: _Numbers, paper:
    _OptionalSpectra, paper_targets: _OptionalTargets, weights: _Numbers, status: _StatusName,
    response: _Reading, n_factor: _Numbers, nominal_dot_area: _Integers, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def pol_refl_to_hue_gray(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_to_hue_gray(
    spectra: _Spectra, targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _HueStatus, *, out: Any = None, ok:
    Literal[False] = False
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array']]: ...
@overload
def pol_refl_to_hue_gray(
    spectra: _Spectra, targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _HueStatus, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def pol_refl_to_print_contrast(solid: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_to_print_contrast(
    solid: _Spectra, solid_targets: _Numbers, tint: _Spectra, tint_targets: _Numbers, paper:
    _OptionalSpectra, paper_targets: _OptionalTargets, weights: _Numbers, status: _StatusName,
    response: _Reading, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def pol_refl_to_print_contrast(
    solid: _Spectra, solid_targets: _Numbers, tint: _Spectra, tint_targets: _Numbers, paper:
    _OptionalSpectra, paper_targets: _OptionalTargets, weights: _Numbers, status: _StatusName,
    response: _Reading, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def pol_refl_to_trap(second: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def pol_refl_to_trap(
    second: _Spectra, second_targets: _Numbers, first: _Spectra, first_targets: _Numbers,
    overprint: _Spectra, overprint_targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _StatusName, response: _Reading, *, out: Any =
    None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def pol_refl_to_trap(
    second: _Spectra, second_targets: _Numbers, first: _Spectra, first_targets: _Numbers,
    overprint: _Spectra, overprint_targets: _Numbers, paper: _OptionalSpectra, paper_targets:
    _OptionalTargets, weights: _Numbers, status: _StatusName, response: _Reading, *, out: Any =
    None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_ab_error_weights(spectra1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_ab_error_weights(
    spectra1: _Spectra, spectra2: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any =
    None, ok: Literal[False] = False
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.floating[Any]], '(..., 31)']]: ...
@overload
def refl_to_ab_error_weights(
    spectra1: _Spectra, spectra2: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any =
    None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def refl_to_brightness(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_brightness(
    spectra: _Spectra, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_brightness(
    spectra: _Spectra, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_cie_yxy(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_cie_yxy(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def refl_to_cie_yxy(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def refl_to_cielab(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_cielab(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def refl_to_cielab(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def refl_to_cielch(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_cielch(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def refl_to_cielch(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def refl_to_cieluv(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_cieluv(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def refl_to_cieluv(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def refl_to_densities(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_densities(
    spectra: _Spectra, paper: _OptionalSpectra, status: _StatusName, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 9)']: ...
@overload
def refl_to_densities(
    spectra: _Spectra, paper: _OptionalSpectra, status: _StatusName, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 9)'], _Flags]: ...
@overload
def refl_to_densities_no_paper(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_densities_no_paper(
    spectra: _Spectra, status: _StatusName, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 9)']: ...
@overload
def refl_to_densities_no_paper(
    spectra: _Spectra, status: _StatusName, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 9)'], _Flags]: ...
@overload
def refl_to_density(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_density(
    spectra: _Spectra, paper: _OptionalSpectra, status: _StatusName, response: _Reading, *, out:
    Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_density(
    spectra: _Spectra, paper: _OptionalSpectra, status: _StatusName, response: _Reading, *, out:
    Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_din6172(spectra1: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_din6172(
    spectra1: _Spectra, spectra2: _Spectra, illum_obs1: _Illuminant, illum_obs2: _Illuminant, *,
    out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_din6172(
    spectra1: _Spectra, spectra2: _Spectra, illum_obs1: _Illuminant, illum_obs2: _Illuminant, *,
    out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_dot_area(solid: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_dot_area(
    solid: _Spectra, tint: _Spectra, paper: _OptionalSpectra, status: _StatusName, response:
    _Reading, n_factor: _Numbers = 1, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_dot_area(
    solid: _Spectra, tint: _Spectra, paper: _OptionalSpectra, status: _StatusName, response:
    _Reading, n_factor: _Numbers = 1, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_dot_gain(solid: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_dot_gain(
    solid: _Spectra, tint: _Spectra, paper: _OptionalSpectra, status: _StatusName, response:
    _Reading, n_factor: _Numbers, nominal_dot_area: _Integers, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_dot_gain(
    solid: _Spectra, tint: _Spectra, paper: _OptionalSpectra, status: _StatusName, response:
    _Reading, n_factor: _Numbers, nominal_dot_area: _Integers, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_hue_gray(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_hue_gray(
    spectra: _Spectra, paper: _OptionalSpectra, status: _HueStatus, *, out: Any = None, ok:
    Literal[False] = False
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array']]: ...
@overload
def refl_to_hue_gray(
    spectra: _Spectra, paper: _OptionalSpectra, status: _HueStatus, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_hunter_lab(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_hunter_lab(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def refl_to_hunter_lab(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def refl_to_pol_intercept(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_pol_intercept(
    spectra: _Spectra, red_density: _Numbers, green_density: _Numbers, blue_density: _Numbers,
    *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_pol_intercept(
    spectra: _Spectra, red_density: _Numbers, green_density: _Numbers, blue_density: _Numbers,
    *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_print_contrast(solid: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_print_contrast(
    solid: _Spectra, tint: _Spectra, paper: _OptionalSpectra, status: _StatusName, response:
    _Reading, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_print_contrast(
    solid: _Spectra, tint: _Spectra, paper: _OptionalSpectra, status: _StatusName, response:
    _Reading, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_refl_density(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_refl_density(
    spectra: _Spectra, status: _StatusName, response: _ResponseName, *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_refl_density(
    spectra: _Spectra, status: _StatusName, response: _ResponseName, *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_rgb(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_rgb(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'uint32 or array']: ...
@overload
def refl_to_rgb(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'uint32 or array'], _Flags]: ...
@overload
def refl_to_trap(second: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_trap(
    second: _Spectra, first: _Spectra, overprint: _Spectra, paper: _OptionalSpectra, status:
    _StatusName, response: _Reading, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_trap(
    second: _Spectra, first: _Spectra, overprint: _Spectra, paper: _OptionalSpectra, status:
    _StatusName, response: _Reading, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_white_e313_98(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_white_e313_98(
    spectra: _Spectra, illum_obs: _WhitenessIlluminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[Any, 'float64 or array']: ...
@overload
def refl_to_white_e313_98(
    spectra: _Spectra, illum_obs: _WhitenessIlluminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], _Flags]: ...
@overload
def refl_to_xyz(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_xyz(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def refl_to_xyz(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def refl_to_xyzs(spectra: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def refl_to_xyzs(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[False] = False
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.floating[Any]], '(..., 31)']]: ...
@overload
def refl_to_xyzs(
    spectra: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok:
    Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.floating[Any]], '(..., 31)'], Annotated[NDArray[np.floating[Any]], '(..., 31)'], _Flags]: ...
@overload
def saunderson(refl: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def saunderson(
    refl: _Numbers, k1: _Numbers, k2: _Numbers, *, out: Any = None
) -> Annotated[Any, 'float64 or array']: ...
@overload
def un_saunderson(refl: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def un_saunderson(
    refl: _Numbers, k1: _Numbers, k2: _Numbers, *, out: Any = None
) -> Annotated[Any, 'float64 or array']: ...
@overload
def unpack_rgb(packed: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def unpack_rgb(
    packed: _Integers, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[NDArray[np.integer[Any]], '(..., 3)']: ...
@overload
def unpack_rgb(
    packed: _Integers, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.integer[Any]], '(..., 3)'], _Flags]: ...
@overload
def verbal_color_difference(standard: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def verbal_color_difference(
    standard: _Spectra, sample: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', selector:
    _Integers = 0, *, ok: Literal[False] = False
) -> tuple[Annotated[Any, 'str320 or array'], Annotated[Any, 'str320 or array'], Annotated[Any, 'str320 or array']]: ...
@overload
def verbal_color_difference(
    standard: _Spectra, sample: _Spectra, illum_obs: _Illuminant = 'D50_2DEG', selector:
    _Integers = 0, *, ok: Literal[True]
) -> tuple[Annotated[Any, 'str320 or array'], Annotated[Any, 'str320 or array'], Annotated[Any, 'str320 or array'], _Flags]: ...
@overload
def xyz_to_cie_yxy(xyz: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def xyz_to_cie_yxy(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def xyz_to_cie_yxy(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def xyz_to_cielab(xyz: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def xyz_to_cielab(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def xyz_to_cielab(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def xyz_to_cielch(xyz: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def xyz_to_cielch(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def xyz_to_cielch(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def xyz_to_cieluv(xyz: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def xyz_to_cieluv(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[False] =
    False
) -> Annotated[NDArray[np.floating[Any]], '(..., 3)']: ...
@overload
def xyz_to_cieluv(
    xyz: _Colours, illum_obs: _Illuminant = 'D50_2DEG', *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[NDArray[np.floating[Any]], '(..., 3)'], _Flags]: ...
@overload
def xyz_to_rgb(xyz: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def xyz_to_rgb(
    xyz: _Colours, *, out: Any = None, ok: Literal[False] = False
) -> Annotated[Any, 'uint32 or array']: ...
@overload
def xyz_to_rgb(
    xyz: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'uint32 or array'], _Flags]: ...
@overload
def xyz_to_xyz(xyz: _Other, *others: Any, **named: Any) -> Any: ...
@overload
def xyz_to_xyz(
    xyz: _Colours, *, out: Any = None, ok: Literal[False] = False
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array']]: ...
@overload
def xyz_to_xyz(
    xyz: _Colours, *, out: Any = None, ok: Literal[True]
) -> tuple[Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], Annotated[Any, 'float64 or array'], _Flags]: ...

def get_hifi_constants() -> tuple[_Row, _Row, _Row, _Row]: ...
def set_hifi_constants(
    wavelengths: ArrayLike, shape1: Optional[ArrayLike] = None, shape2: Optional[ArrayLike] = None,
    shape3: Optional[ArrayLike] = None
) -> None: ...
def get_hexachrome_constants() -> tuple[_Row, _Row, _Row]: ...
def set_hexachrome_constants(
    wavelengths: ArrayLike, shape1: Optional[ArrayLike] = None, shape2: Optional[ArrayLike] = None
) -> None: ...
def get_spectralx_constants() -> tuple[float, float, float, float, float]: ...
def set_spectralx_constants(
    tolerance: float, reserved: float, centre: float, inner: float, outer: float
) -> None: ...
def get_achromatic_constants() -> tuple[float, float, float, float]: ...
def set_achromatic_constants(L1: float, L2: float, C1: float, C2: float) -> None: ...
def settings(
    *, hifi: Optional[Sequence[ArrayLike]] = None, hexachrome: Optional[Sequence[ArrayLike]] = None,
    spectralx: Optional[Sequence[float]] = None, achromatic: Optional[Sequence[float]] = None
) -> AbstractContextManager[None]: ...
def get_num_illuminant_observers() -> int: ...
def get_num_responses() -> int: ...
def get_num_statuses() -> int: ...
def resample(values: ArrayLike, wavelengths: ArrayLike) -> NDArray[np.float64]: ...

class CIEDE2000:
    @overload
    @staticmethod
    def calculate(lab1: _Other, *others: Any, **named: Any) -> Any: ...
    @overload
    @staticmethod
    def calculate(
        lab1: _Colours, lab2: _Colours, kL: _Numbers = 1, kC: _Numbers = 1, kH: _Numbers = 1, *,
        out: Any = None
    ) -> Annotated[Any, 'float64 or array']: ...
    @overload
    @staticmethod
    def is_zero(value: _Other, *others: Any, **named: Any) -> Any: ...
    @overload
    @staticmethod
    def is_zero(
        value: _Numbers, tolerance: _Numbers, *, out: Any = None
    ) -> Annotated[Any, 'bool or array']: ...
    @overload
    @staticmethod
    def convert_to_degrees(radians: _Other, *others: Any, **named: Any) -> Any: ...
    @overload
    @staticmethod
    def convert_to_degrees(
        radians: _Numbers, *, out: Any = None
    ) -> Annotated[Any, 'float64 or array']: ...
    @overload
    @staticmethod
    def convert_to_radians(degrees: _Other, *others: Any, **named: Any) -> Any: ...
    @overload
    @staticmethod
    def convert_to_radians(
        degrees: _Numbers, *, out: Any = None
    ) -> Annotated[Any, 'float64 or array']: ...
