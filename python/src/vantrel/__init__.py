"""Vantrel: colour measurement for the graphic arts, over whole arrays.

    import vantrel
    lab = vantrel.refl_to_cielab(spectra, "D50_2DEG")    # (..., 31) -> (..., 3)

A spectrum is the last dimension of an array: 31 values, the reflectance at 400, 410, ... 700 nm
in percent. Functions take anything that broadcasts; each is a NumPy generalized ufunc underneath
(`vantrel.ufuncs`), runs without the interpreter lock, and takes Dask and xarray arrays as well.

The examples of the functions use these spectra:

>>> nm = np.arange(400, 701, 10)
>>> paper = np.full(31, 85.0)
>>> cyan, magenta, yellow = (paper - 75 * dark for dark in (nm > 580, abs(nm - 540) < 50, nm < 490))
>>> tint = (magenta + paper) / 2

An argument that is wrong for the whole call raises ValueError. A row that the library refuses,
black where a chromaticity is asked for, is NaN, and `ok=True` adds an output that tells which rows
were accepted.
"""

from . import _ufuncs as ufuncs
from . import plot
from ._enums import IllumObs, Response, Status
from ._colour import (
    calc_labch,
    cielab_to_cielch,
    cielab_to_cielch_ex,
    cielch_to_cielab,
    lab_to_xyz,
    refl_to_cie_yxy,
    refl_to_cielab,
    refl_to_cielch,
    refl_to_cieluv,
    refl_to_hunter_lab,
    refl_to_rgb,
    refl_to_xyz,
    refl_to_xyzs,
    unpack_rgb,
    xyz_to_cie_yxy,
    xyz_to_cielab,
    xyz_to_cielch,
    xyz_to_cieluv,
    xyz_to_rgb,
    xyz_to_xyz,
)
from ._difference import (
    CIEDE2000,
    cielch_to_de94,
    lab_to_de2000,
    lab_to_de2000_ex,
    lab_to_de94,
    lab_to_de_cmc,
    lab_to_de_lab,
    lab_to_dh,
    refl_to_din6172,
    verbal_color_difference,
)
from ._paper import (
    cie_yxy_to_white_e313_98,
    metamerism,
    refl_to_brightness,
    refl_to_white_e313_98,
)
from ._density import (
    adjust_for_paper_refls,
    calculate_ccr_densities,
    calculate_special_density,
    calculate_spectral_density,
    calculate_spectralx_density,
    choose_bp_wavelen,
    determine_density_response,
    find_density_max,
    find_density_min,
    find_max_density_points,
    get_normalized_density_weights,
    get_num_status_responses,
    is_chromatic,
    is_chromatic_lch,
    refl_to_densities,
    refl_to_densities_no_paper,
    refl_to_density,
    refl_to_refl_density,
)
from ._print import (
    color_at_equivalent_density,
    density_from_dot_area,
    density_ratio,
    density_to_dot_area,
    density_to_hue_gray,
    density_to_integrated_refl,
    density_to_print_contrast,
    density_to_trap,
    refl_to_dot_area,
    refl_to_dot_gain,
    refl_to_hue_gray,
    refl_to_pol_intercept,
    refl_to_print_contrast,
    refl_to_trap,
)
from ._polarisation import (
    pol_determine_density_response,
    pol_refl_adjust,
    pol_refl_auto_adjust,
    pol_refl_to_densities,
    pol_refl_to_density,
    pol_refl_to_dot_area,
    pol_refl_to_dot_gain,
    pol_refl_to_hue_gray,
    pol_refl_to_print_contrast,
    pol_refl_to_trap,
)
from ._inks import (
    calculate_tint_color,
    combine_3_ink_colors,
    combine_3_ink_colors_ex,
    combine_ink_colors,
    combine_ink_colors_ex,
    estimate_color,
    estimate_refls,
    estimate_refls_ex,
    estimate_refls_ex_for_best_visual_color,
    estimate_refls_for_best_visual_color,
    estimate_refls_for_thickness,
    estimate_refls_for_tint_color,
    estimate_refls_for_tint_color_for_best_visual_color,
    estimate_tint_color,
    refl_to_ab_error_weights,
    saunderson,
    un_saunderson,
)
from ._constants import (
    den_weight,
    get_achromatic_constants,
    get_hexachrome_constants,
    get_hifi_constants,
    get_num_illuminant_observers,
    get_num_responses,
    get_num_statuses,
    get_spectralx_constants,
    set_achromatic_constants,
    set_hexachrome_constants,
    set_hifi_constants,
    set_spectralx_constants,
    settings,
)
from ._resample import resample
from ._sheet import Origin, Sheet, Source, read, reads
from ._ink import Ink
from ._predictions import Predictions
from ._results import Comparison, Report
from ._run import Run
from ._judge import compare, ink, predict, report, run

__version__ = ufuncs.version
__all__ = [name for name in dir() if not name.startswith("_")]  # what help() lists
