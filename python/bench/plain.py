"""What a user of NumPy writes: matrix products over whole arrays, no loop over rows."""

import numpy as np

import vantrel
from vantrel import _ufuncs

# Of status T: visual, red, green, blue.
FILTERS = _ufuncs.den_weight[vantrel.Status.T_STATUS, :4].T / 1e7
WORDS = np.array(
    ["On Target", "Too Dark", "Too Light", "Too Green", "Too Red", "Too Blue", "Too Yellow"]
)


class Colorimetry:
    """The weights of a combination of illuminant and observer, and its white."""

    def __init__(self, illum_obs):
        self.weights = vantrel.refl_to_xyz(100 * np.eye(31), illum_obs) / 100
        self.white = np.empty(3)
        vantrel.lab_to_xyz([100, 0, 0], illum_obs, out=self.white)

    def lab(self, spectra):
        t = (spectra @ self.weights) / self.white
        f = np.where(t <= 0.008856, 7.787 * t + 16 / 116, np.cbrt(t))
        x, y, z = f[..., 0], f[..., 1], f[..., 2]
        return 116 * y - 16, 500 * (x - y), 200 * (y - z)


D50, A, D65 = map(Colorimetry, ("D50_2DEG", "A_2DEG", "D65_10DEG"))


def densities(spectra, filters=FILTERS):
    return -np.log10(np.maximum(spectra @ filters, 1e-5))


def density(spectra):
    return densities(spectra, np.ascontiguousarray(FILTERS[:, 2]))


def densities_over(paper, spectra):
    result = np.zeros((len(spectra), 9))
    result[:, :4] = densities(spectra) - densities(paper)
    return result


def dot_gain(solid, tints, paper, n, nominal):
    to_nepers = -np.log(10) / n
    below = density(paper)
    by_solid = 1 - np.exp(to_nepers * (density(solid) - below))
    by_tints = 1 - np.exp(to_nepers * (density(tints) - below))
    return np.maximum(100 * by_tints / by_solid - nominal, 0)


def response(spectra, paper):
    ratio = spectra / paper
    adjusted = spectra * ratio
    adjusted *= np.where(ratio < 10**-0.5, 1, ratio)
    L, a, b = D65.lab(adjusted)
    chromatic = np.sqrt(a * a + b * b) > 12.6 - 0.11428571428571 * L
    return np.where(chromatic, densities(adjusted).argmax(-1), 0)


def words(standard, samples):
    def word(d, below, above):
        return WORDS[np.where(np.abs(d) <= 0.5, 0, np.where(d < 0, below, above))]

    dL, da, db = (s - r for s, r in zip(D50.lab(samples), D50.lab(standard)))
    return word(dL, 1, 2), word(da, 3, 4), word(db, 5, 6)


def metamerism(standard, samples):
    def delta_e(light):
        dL, da, db = (s - r for s, r in zip(light.lab(samples), light.lab(standard)))
        return np.sqrt(dL * dL + da * da + db * db)

    return delta_e(D50) + delta_e(A)


def thickness(inks, share, paper):
    def absorbance(refl):
        r = refl / 100
        return -np.log(r / (0.4 + 0.6 * r))

    below = absorbance(paper)
    r = np.exp(-np.maximum((absorbance(inks) - below) * share, 0) - below)
    return 40 * r / (1 - 0.6 * r)


def overprint(first, second):
    d1, d2 = np.log10(100 / first), np.log10(100 / second)
    lighter, denser = np.minimum(d1, d2), np.maximum(d1, d2)
    share = 0.5 / lighter.max(-1, keepdims=True)
    return 100 * np.exp(-np.log(10) * np.where(lighter > 0.6, denser + share * lighter, denser))


def estimate(inks, percent, paper):
    layers = inks + (paper - inks) * ((100 - percent) / 100)[:, None]
    return overprint(overprint(layers[:, 0], layers[:, 1]), layers[:, 2])
