"""Densities under ten statuses, sets of them, and the response that reads an ink.

ISO 5-3 and ISO 5-4: D = -log10 of the filter-weighted reflectance factor, at most 5. Where a paper
is given, its own density is subtracted; None measures absolutely.
"""

from ._function import function
from ._kinds import (
    CCRStatus,
    Colours,
    Illuminant,
    Integers,
    Numbers,
    OptionalSpectra,
    Reading,
    ResponseName,
    Spectra,
    StatusName,
)


@function("number")
def get_num_status_responses(status: "StatusName"):
    """How many responses a status measures; 0 for the two spectral statuses.

    >>> print(vantrel.get_num_status_responses("T"))
    4
    """


@function("weights", "first", "peak", "last")
def get_normalized_density_weights(status: "StatusName", response: "ResponseName"):
    """A filter scaled to a peak of 100: (weights, first, peak, last).

    The last three are wavelengths in nm of the first weight that is not zero, of the largest and of
    the last. A filter without a positive weight is refused.

    >>> print(*vantrel.get_normalized_density_weights("E", "GREEN")[1:])
    470.0 530.0 630.0
    """


@function("density")
def refl_to_density(
    spectra: "Spectra", paper: "OptionalSpectra", status: "StatusName", response: "Reading"
):
    """Density (ISO 5-3, ISO 5-4) of spectra in percent, over a paper or absolute (None).

    The response is 0 to 8; for SPECTRAL_STATUS a wavelength of 391 to 709 nm (the paper plays no
    part); for SPECTRALX_STATUS a request of 0 to 30 as in calculate_spectralx_density(). CCR1_STATUS
    is read without the correction of calculate_ccr_densities().

    >>> print(np.round(vantrel.refl_to_density(magenta, paper, "E", "GREEN"), 3))
    0.872
    """


@function("refl")
def refl_to_refl_density(spectra: "Spectra", status: "StatusName", response: "ResponseName"):
    """Filter-weighted reflectance in percent, at least 0.00099999993; 99.9999975 for a white.

    >>> print(np.round(vantrel.refl_to_refl_density(magenta, "E", "GREEN"), 2))
    11.41
    """


@function("densities")
def refl_to_densities(spectra: "Spectra", paper: "OptionalSpectra", status: "StatusName"):
    """Density sets: nine densities in the order of Response, 0 where the status has none.

    The two spectral statuses give nine times the same density.

    >>> print(np.round(vantrel.refl_to_densities(magenta, paper, "E"), 2))
    [0.33 0.   0.87 0.   0.   0.   0.   0.   0.  ]
    """


@function("densities")
def refl_to_densities_no_paper(spectra: "Spectra", status: "StatusName"):
    """Density sets without a paper; as refl_to_densities().

    >>> print(np.round(vantrel.refl_to_densities_no_paper(magenta, "E"), 2))
    [0.4  0.07 0.94 0.07 0.   0.   0.   0.   0.  ]
    """


@function("response")
def determine_density_response(
    spectra: "Spectra", status: "StatusName", paper: "OptionalSpectra" = None
):
    """Which response reads these inks: the visual one for neutrals, else that of most density.

    For SPECTRAL_STATUS a wavelength (420, 440, ... 700 nm), for SPECTRALX_STATUS a band (2 to 28;
    0 for a neutral); 9 where the density set cannot be computed. Note the order of the arguments.

    >>> print(vantrel.determine_density_response([cyan, magenta, yellow], "E", paper))
    [1 2 3]
    """


@function("density")
def calculate_spectral_density(refl: "Numbers"):
    """Density -log10 of single reflectances in percent, at most 7.

    >>> print(np.round(vantrel.calculate_spectral_density([100, 10, 1]), 1))
    [0. 1. 2.]
    """


@function("refl")
def adjust_for_paper_refls(spectra: "Spectra", paper: "Spectra"):
    """Spectra with their contrast against the paper exaggerated.

    In every band the density above the paper is tripled, or doubled where it is more than 0.5.

    >>> print(np.round(vantrel.adjust_for_paper_refls(magenta, paper)[[0, 15]], 3))
    [85.     1.176]
    """


@function("density", "response")
def find_density_max(densities: "Numbers", include_visual: "Integers"):
    """The largest density above 0 of sets of nine, and its response: (density, response).

    The lowest response on a tie; 0 and -1 where there is none. The visual density counts when
    `include_visual` is not 0.

    >>> print(*vantrel.find_density_max([0.3, 0.1, 0.9, 0.5, 0, 0, 0, 0, 0], 0))
    0.9 2
    """


@function("density", "response")
def find_density_min(densities: "Numbers", include_visual: "Integers"):
    """The smallest density below 100 of sets of nine that is not 0, and its response.

    100 and -1 where there is none; otherwise as find_density_max().

    >>> print(*vantrel.find_density_min([0.3, 0.1, 0.9, 0.5, 0, 0, 0, 0, 0], 0))
    0.1 1
    """


@function("densities")
def calculate_ccr_densities(spectra: "Spectra", paper: "OptionalSpectra", status: "CCRStatus"):
    """Density sets corrected for the overlap of the filters, under CCR1_STATUS or CCR2_STATUS.

    Nine values: visual, red, green, blue and five zeros.

    >>> print(np.round(vantrel.calculate_ccr_densities(magenta, paper, "CCR1"), 2))
    [ 0.46 -0.03  0.86  0.    0.    0.    0.    0.    0.  ]
    """


@function("density", "band")
def calculate_spectralx_density(spectra: "Spectra", paper: "OptionalSpectra", request: "Integers"):
    """Density of a five-band window: (density, band).

    Request 2 to 28: at that band; 0: the visual density of Status T (band -1); any other: at the
    absorption peak that borders the brightest stretch of the spectrum.

    >>> print(np.round(vantrel.calculate_spectralx_density(magenta, paper, 14), 3))
    [ 0.929 14.   ]
    """


@function("densities", "bands", "count")
def find_max_density_points(spectra: "Spectra"):
    """Absorption peaks in order of wavelength: (densities, bands, count).

    Beyond the count, densities are NaN and bands -1. Band b lies at 400 + 10 b nm.

    >>> densities, bands, count = vantrel.find_max_density_points(magenta)
    >>> print(densities[:count].round(3), bands[:count])
    [1.] [12]
    """


@function("index")
def choose_bp_wavelen(spectra: "Spectra", bands: "Integers", count: "Integers"):
    """Index of the peak that borders the brightest stretch, on the side nearer to its crest.

    Takes `bands` and `count` of find_max_density_points(); 0 for a band outside 0 to 30.

    >>> _, bands, count = vantrel.find_max_density_points(magenta)
    >>> print(vantrel.choose_bp_wavelen(magenta, bands, count))
    0
    """


@function("density")
def calculate_special_density(spectra: "Spectra", centre: "Integers", weights: "Numbers"):
    """Density of any window: `weights`, its middle one at band `centre`.

    5 where the windowed sum is 0 or less; 0 for a window that reaches outside the spectrum.

    >>> print(np.round(vantrel.calculate_special_density(magenta, 14, [0.5, 1, 0.5]), 3))
    1.0
    """


@function("chromatic")
def is_chromatic(spectra: "Spectra", illum_obs: "Illuminant" = "D65_10DEG"):
    """Whether spectra are chromatic: C* above a line over L*, get_achromatic_constants().

    >>> print(vantrel.is_chromatic([paper, magenta]))
    [False  True]
    """


@function("chromatic")
def is_chromatic_lch(lch: "Colours"):
    """Whether L*C*h are chromatic; as is_chromatic().

    >>> print(vantrel.is_chromatic_lch([[50, 2, 0], [50, 40, 0]]))
    [False  True]
    """
