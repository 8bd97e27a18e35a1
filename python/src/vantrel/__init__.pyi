"""Types of the package, written by stubs.py. Results are arrays of the kind that was handed in, NumPy
scalars for single rows; with `ok=True` a tuple that ends with the flags."""

from enum import IntEnum
from typing import Any, Sequence, Union

import numpy as np
from numpy.typing import ArrayLike, NDArray

Spectra = Colours = Inks = Numbers = Integers = ArrayLike
OptionalSpectra = OptionalTargets = Union[ArrayLike, None]
Names = Union[str, Sequence[str], ArrayLike]
Illuminant = WhitenessIlluminant = StatusName = CCRStatus = HueStatus = Names
ResponseName = InkResponse = Reading = Names

__version__: str
ufuncs: Any
den_weight: NDArray[np.int64]

class IllumObs(IntEnum):
    A_2DEG = 0
    A_10DEG = 1
    C_2DEG = 2
    C_10DEG = 3
    D50_2DEG = 4
    D50_10DEG = 5
    D65_2DEG = 6
    D65_10DEG = 7
    F2_2DEG = 8
    F2_10DEG = 9
    F7_2DEG = 10
    F7_10DEG = 11
    F11_2DEG = 12
    F11_10DEG = 13
    F12_2DEG = 14
    F12_10DEG = 15
    D75_2DEG = 16
    D75_10DEG = 17

class Response(IntEnum):
    VISUAL_RESPONSE = 0
    RED_RESPONSE = 1
    GREEN_RESPONSE = 2
    BLUE_RESPONSE = 3
    HIFI1_RESPONSE = 4
    HIFI2_RESPONSE = 5
    HIFI3_RESPONSE = 6
    HEXACHROME1_RESPONSE = 7
    HEXACHROME2_RESPONSE = 8

class Status(IntEnum):
    A_STATUS = 0
    E_STATUS = 1
    I_STATUS = 2
    T_STATUS = 3
    SPECTRAL_STATUS = 4
    SPECTRALX_STATUS = 5
    HIFI_STATUS = 6
    HEXACHROME_STATUS = 7
    CCR1_STATUS = 8
    CCR2_STATUS = 9

def calc_labch(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def cielab_to_cielch(lab: Colours, *, out: Any = ..., ok: bool = ...) -> Any: ...
def cielab_to_cielch_ex(
    lab: Colours,
    round: Integers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def cielch_to_cielab(lch: Colours, *, out: Any = ..., ok: bool = ...) -> Any: ...
def lab_to_xyz(
    lab: Colours,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_cie_yxy(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_cielab(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_cielch(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_cieluv(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_hunter_lab(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_rgb(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_xyz(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_xyzs(
    spectra: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def xyz_to_cie_yxy(
    xyz: Colours,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def xyz_to_cielab(
    xyz: Colours,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def xyz_to_cielch(
    xyz: Colours,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def xyz_to_cieluv(
    xyz: Colours,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def xyz_to_rgb(xyz: Colours, *, out: Any = ..., ok: bool = ...) -> Any: ...
def xyz_to_xyz(xyz: Colours, *, out: Any = ..., ok: bool = ...) -> Any: ...
def cie_yxy_to_white_e313_98(
    Yxy: Colours,
    illum_obs: WhitenessIlluminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def cielch_to_de94(
    sample: Colours,
    reference: Colours,
    kL: Numbers = ...,
    kC: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def lab_to_de2000(
    lab1: Colours,
    lab2: Colours,
    kL: Numbers = ...,
    kC: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def lab_to_de2000_ex(
    lab1: Colours,
    lab2: Colours,
    kL: Numbers = ...,
    kC: Numbers = ...,
    kH: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def lab_to_de94(
    sample: Colours,
    reference: Colours,
    kL: Numbers = ...,
    kC: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def lab_to_de_cmc(
    sample: Colours,
    reference: Colours,
    l: Numbers = ...,
    c: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def lab_to_de_lab(lab1: Colours, lab2: Colours, *, out: Any = ..., ok: bool = ...) -> Any: ...
def lab_to_dh(lab1: Colours, lab2: Colours, *, out: Any = ..., ok: bool = ...) -> Any: ...
def metamerism(
    standard: Spectra,
    sample: Spectra,
    illum_obs1: Illuminant,
    illum_obs2: Illuminant,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_brightness(spectra: Spectra, *, out: Any = ..., ok: bool = ...) -> Any: ...
def refl_to_din6172(
    spectra1: Spectra,
    spectra2: Spectra,
    illum_obs1: Illuminant,
    illum_obs2: Illuminant,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_white_e313_98(
    spectra: Spectra,
    illum_obs: WhitenessIlluminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def verbal_color_difference(
    standard: Spectra,
    sample: Spectra,
    illum_obs: Illuminant = ...,
    selector: Integers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def adjust_for_paper_refls(
    spectra: Spectra,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def calculate_ccr_densities(
    spectra: Spectra,
    paper: OptionalSpectra,
    status: CCRStatus,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def calculate_special_density(
    spectra: Spectra,
    centre: Integers,
    weights: Numbers,
    *,
    out: Any = ...,
) -> Any: ...
def calculate_spectral_density(refl: Numbers, *, out: Any = ...) -> Any: ...
def calculate_spectralx_density(
    spectra: Spectra,
    paper: OptionalSpectra,
    request: Integers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def choose_bp_wavelen(
    spectra: Spectra,
    bands: Integers,
    count: Integers,
    *,
    out: Any = ...,
) -> Any: ...
def determine_density_response(
    spectra: Spectra,
    status: StatusName,
    paper: OptionalSpectra = ...,
    *,
    out: Any = ...,
) -> Any: ...
def find_density_max(
    densities: Numbers,
    include_visual: Integers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def find_density_min(
    densities: Numbers,
    include_visual: Integers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def find_max_density_points(spectra: Spectra, *, out: Any = ..., ok: bool = ...) -> Any: ...
def get_normalized_density_weights(
    status: StatusName,
    response: ResponseName,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def get_num_status_responses(status: StatusName, *, out: Any = ...) -> Any: ...
def is_chromatic(spectra: Spectra, illum_obs: Illuminant = ..., *, out: Any = ...) -> Any: ...
def is_chromatic_lch(lch: Colours, *, out: Any = ...) -> Any: ...
def refl_to_densities(
    spectra: Spectra,
    paper: OptionalSpectra,
    status: StatusName,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_densities_no_paper(
    spectra: Spectra,
    status: StatusName,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_density(
    spectra: Spectra,
    paper: OptionalSpectra,
    status: StatusName,
    response: Reading,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_refl_density(
    spectra: Spectra,
    status: StatusName,
    response: ResponseName,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def color_at_equivalent_density(
    reference: Spectra,
    sample: Spectra,
    status: StatusName,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def density_from_dot_area(
    solid_density: Numbers,
    dot_area: Numbers,
    n_factor: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def density_ratio(
    reference: Spectra,
    sample: Spectra,
    status: StatusName,
    *,
    out: Any = ...,
) -> Any: ...
def density_to_dot_area(
    solid_density: Numbers,
    tint_density: Numbers,
    n_factor: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def density_to_hue_gray(
    red_density: Numbers,
    green_density: Numbers,
    blue_density: Numbers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def density_to_integrated_refl(
    density: Numbers,
    status: HueStatus,
    response: InkResponse,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def density_to_print_contrast(
    solid_density: Numbers,
    tint_density: Numbers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def density_to_trap(
    overprint_density: Numbers,
    second_density: Numbers,
    first_density: Numbers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_dot_area(
    solid: Spectra,
    tint: Spectra,
    paper: OptionalSpectra,
    status: StatusName,
    response: Reading,
    n_factor: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_dot_gain(
    solid: Spectra,
    tint: Spectra,
    paper: OptionalSpectra,
    status: StatusName,
    response: Reading,
    n_factor: Numbers,
    nominal_dot_area: Integers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_hue_gray(
    spectra: Spectra,
    paper: OptionalSpectra,
    status: HueStatus,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_pol_intercept(
    spectra: Spectra,
    red_density: Numbers,
    green_density: Numbers,
    blue_density: Numbers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_print_contrast(
    solid: Spectra,
    tint: Spectra,
    paper: OptionalSpectra,
    status: StatusName,
    response: Reading,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_trap(
    second: Spectra,
    first: Spectra,
    overprint: Spectra,
    paper: OptionalSpectra,
    status: StatusName,
    response: Reading,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_determine_density_response(
    spectra: Spectra,
    targets: Numbers,
    status: StatusName,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    *,
    out: Any = ...,
) -> Any: ...
def pol_refl_adjust(
    spectra: Spectra,
    response: ResponseName,
    targets: Numbers,
    weights: Numbers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_auto_adjust(
    spectra: Spectra,
    targets: Numbers,
    weights: Numbers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_to_densities(
    spectra: Spectra,
    targets: Numbers,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    status: StatusName,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_to_density(
    spectra: Spectra,
    targets: Numbers,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    status: StatusName,
    response: Reading,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_to_dot_area(
    solid: Spectra,
    solid_targets: Numbers,
    tint: Spectra,
    tint_targets: Numbers,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    status: StatusName,
    response: Reading,
    n_factor: Numbers = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_to_dot_gain(
    solid: Spectra,
    solid_targets: Numbers,
    tint: Spectra,
    tint_targets: Numbers,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    status: StatusName,
    response: Reading,
    n_factor: Numbers,
    nominal_dot_area: Integers,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_to_hue_gray(
    spectra: Spectra,
    targets: Numbers,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    status: HueStatus,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_to_print_contrast(
    solid: Spectra,
    solid_targets: Numbers,
    tint: Spectra,
    tint_targets: Numbers,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    status: StatusName,
    response: Reading,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def pol_refl_to_trap(
    second: Spectra,
    second_targets: Numbers,
    first: Spectra,
    first_targets: Numbers,
    overprint: Spectra,
    overprint_targets: Numbers,
    paper: OptionalSpectra,
    paper_targets: OptionalTargets,
    weights: Numbers,
    status: StatusName,
    response: Reading,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def calculate_tint_color(
    ink: Spectra,
    paper: Spectra,
    percent: Integers,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def combine_3_ink_colors(
    spectra1: Spectra,
    spectra2: Spectra,
    spectra3: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def combine_3_ink_colors_ex(
    lab1: Colours,
    lab2: Colours,
    lab3: Colours,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def combine_ink_colors(
    spectra1: Spectra,
    spectra2: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def combine_ink_colors_ex(
    lab1: Colours,
    lab2: Colours,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_color(
    inks: Inks,
    percent: Integers,
    paper: Colours,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_refls(
    inks: Inks,
    percent: Integers,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_refls_ex(
    n: Integers,
    first: Spectra,
    second: OptionalSpectra,
    third: OptionalSpectra,
    percent: Integers,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_refls_ex_for_best_visual_color(
    n: Integers,
    first: Spectra,
    second: OptionalSpectra,
    third: OptionalSpectra,
    percent: Integers,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_refls_for_best_visual_color(
    inks: Inks,
    percent: Integers,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_refls_for_thickness(
    ink: Spectra,
    thickness: Numbers,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_refls_for_tint_color(
    ink: Spectra,
    percent: Integers,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_refls_for_tint_color_for_best_visual_color(
    ink: Spectra,
    percent: Integers,
    paper: Spectra,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def estimate_tint_color(
    ink: Colours,
    percent: Integers,
    paper: Colours,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def refl_to_ab_error_weights(
    spectra1: Spectra,
    spectra2: Spectra,
    illum_obs: Illuminant = ...,
    *,
    out: Any = ...,
    ok: bool = ...,
) -> Any: ...
def saunderson(refl: Numbers, k1: Numbers, k2: Numbers, *, out: Any = ...) -> Any: ...
def un_saunderson(refl: Numbers, k1: Numbers, k2: Numbers, *, out: Any = ...) -> Any: ...
def get_achromatic_constants() -> Any: ...
def get_hexachrome_constants() -> Any: ...
def get_hifi_constants() -> Any: ...
def get_num_illuminant_observers() -> int: ...
def get_num_responses() -> int: ...
def get_num_statuses() -> int: ...
def get_spectralx_constants() -> Any: ...
def set_achromatic_constants(L1: Any, L2: Any, C1: Any, C2: Any) -> None: ...
def set_hexachrome_constants(wavelengths: Any, shape1: Any = ..., shape2: Any = ...) -> None: ...
def set_hifi_constants(
    wavelengths: Any,
    shape1: Any = ...,
    shape2: Any = ...,
    shape3: Any = ...,
) -> None: ...
def set_spectralx_constants(
    tolerance: Any,
    reserved: Any,
    centre: Any,
    inner: Any,
    outer: Any,
) -> None: ...

class CIEDE2000:
    @staticmethod
    def calculate(
        lab1: Colours,
        lab2: Colours,
        kL: Numbers = ...,
        kC: Numbers = ...,
        kH: Numbers = ...,
        *,
        out: Any = ...,
    ) -> Any: ...
    @staticmethod
    def is_zero(value: Numbers, tolerance: Numbers, *, out: Any = ...) -> Any: ...
    @staticmethod
    def convert_to_degrees(radians: Numbers, *, out: Any = ...) -> Any: ...
    @staticmethod
    def convert_to_radians(degrees: Numbers, *, out: Any = ...) -> Any: ...
