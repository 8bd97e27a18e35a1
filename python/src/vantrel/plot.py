"""Figures of sheets and of what is said of them, by matplotlib: pip install vantrel[plot].

Each function draws into `ax`, or into a new figure without one, and returns the axes. Patches have
their own colours as a display shows them: the same L*a*b* looks alike under every illuminant, and a
perfect white is white.

    import vantrel.plot
    vantrel.plot.ab_plane(vantrel.read("sheet.cxf")).figure.savefig("gamut.png")
"""

import warnings
from typing import Any, Iterable, List, Optional, Sequence, Tuple, Union

import numpy as np
from numpy.typing import NDArray

from ._colour import refl_to_cielab
from ._results import Comparison, Report
from ._sheet import Sheet, srgb
from ._wavelengths import NM

__all__ = ["ab_plane", "differences", "spectra", "tone_curves"]

_INKS = {"C": "#00a0e0", "M": "#e0007a", "Y": "#d8b800", "K": "#202020"}


def _axes(ax: Optional[Any], **labels: str) -> Any:
    if ax is None:
        import matplotlib.pyplot as plt

        ax = plt.subplots()[1]
    ax.set(**labels)
    return ax


def _check(given: Any, argument: str, *kinds: type) -> None:
    if not isinstance(given, kinds):
        names = " or ".join(kind.__name__ for kind in kinds)
        raise TypeError(f"{argument}: a {names} is needed, not {type(given).__name__}")


def _coloured(lab: NDArray[np.float64], sheet: Union[Sheet, Report]) -> NDArray[np.bool_]:
    """Which of the patches have a colour; warns of the others."""
    coloured = np.asarray(np.isfinite(lab).all(-1))
    if isinstance(sheet, Sheet) and not coloured.all():
        names = [repr(sheet.names[i]) for i in np.flatnonzero(~coloured)]
        more = f" and {len(names) - 5} more" if len(names) > 5 else ""
        told = f"{sheet.file}: no colour, and left out: {', '.join(names[:5])}{more}"
        warnings.warn(told, stacklevel=3)
    return coloured


def _lab(sheet: Union[Sheet, Report]) -> NDArray[np.float64]:
    """L*a*b* of the patches: of a Sheet for D50 and 2 degrees, or as its file has them."""
    if isinstance(sheet, Report):
        return np.array([patch.lab for patch in sheet.patches])
    if sheet.spectra is None:
        assert sheet.lab is not None  # as there are no spectra
        return sheet.lab
    return np.asarray(refl_to_cielab(sheet.spectra, "D50_2DEG"))


def hull(points: Iterable[Tuple[float, float]]) -> List[Tuple[float, float]]:
    """The corners of the convex hull, against the clock (Andrew's monotone chain)."""
    ordered = sorted({(float(x), float(y)) for x, y in points})

    def chain(along: Sequence[Tuple[float, float]]) -> List[Tuple[float, float]]:
        corners: List[Tuple[float, float]] = []
        for x, y in along:
            while len(corners) > 1:
                (x1, y1), (x2, y2) = corners[-2:]
                if (x2 - x1) * (y - y1) > (y2 - y1) * (x - x1):
                    break
                corners.pop()
            corners.append((x, y))
        return corners

    lower, upper = chain(ordered), chain(ordered[::-1])
    return lower[:-1] + upper[:-1] if len(ordered) > 2 else ordered


def spectra(sheet: Sheet, ax: Optional[Any] = None) -> Any:
    """The reflectance of every patch by wavelength, each line in the colour of its patch.

    Parameters
    ----------
    sheet : Sheet
        A patch whose spectrum holds a NaN is left out, with a warning.
    ax : matplotlib.axes.Axes, optional
        Where to draw; a new figure by default.

    Returns
    -------
    ax : matplotlib.axes.Axes

    Raises
    ------
    TypeError
        Where it is no Sheet.
    ValueError
        Where the sheet holds colours alone.

    Examples
    --------
    >>> ax = vantrel.plot.spectra(vantrel.read("examples/two_ink_halftone.txt"))
    >>> len(ax.get_lines()), ax.get_ylabel()
    (31, 'Reflectance, %')
    """
    _check(sheet, "sheet", Sheet)
    if sheet.spectra is None:
        raise ValueError("sheet: it holds colours alone, no spectra")
    lab = _lab(sheet)
    coloured = _coloured(lab, sheet)
    ax = _axes(ax, xlabel="Wavelength, nm", ylabel="Reflectance, %")
    ax.set_facecolor("0.85")  # white shows too
    for refl, colour in zip(sheet.spectra[coloured], srgb(lab[coloured]) / 255):
        ax.plot(NM, refl, color=colour)
    return ax


def tone_curves(report: Report, ax: Optional[Any] = None) -> Any:
    """The dot area of every ink over its nominal value.

    Parameters
    ----------
    report : Report
    ax : matplotlib.axes.Axes, optional
        Where to draw; a new figure by default.

    Returns
    -------
    ax : matplotlib.axes.Axes

    Raises
    ------
    TypeError
        Where it is no Report.

    Examples
    --------
    >>> report = vantrel.report(vantrel.read("examples/two_ink_halftone.txt"))
    >>> [line.get_label() for line in vantrel.plot.tone_curves(report).get_lines()[1:]]
    ['CMYK_M', 'CMYK_Y']
    """
    _check(report, "report", Report)
    ax = _axes(ax, xlabel="Nominal dot area, %", ylabel="Dot area on paper, %")
    ax.plot([0, 100], [0, 100], ":", color="0.6")
    for curve in report.tone_values:
        nominal = [0.0, *(value.nominal for value in curve.values)]
        area = [0.0, *(value.dot_area for value in curve.values)]
        ax.plot(nominal, area, "o-", label=curve.ink, color=_INKS.get(curve.ink.split("_")[-1]))
    if report.tone_values:
        ax.legend()
    ax.set_aspect("equal")
    return ax


def ab_plane(sheet: Union[Sheet, Report, Comparison], ax: Optional[Any] = None) -> Any:
    """The patches in the plane of a* and b*, and the convex hull around them: the gamut of the sheet.

    Of a Comparison the patches of its sample, each with a line from its aim.

    Parameters
    ----------
    sheet : Sheet, Report or Comparison
        Patches without a colour are left out, with a warning.
    ax : matplotlib.axes.Axes, optional
        Where to draw; a new figure by default.

    Returns
    -------
    ax : matplotlib.axes.Axes

    Raises
    ------
    TypeError
        Where it is neither of the three.

    Examples
    --------
    >>> ax = vantrel.plot.ab_plane(vantrel.read("examples/two_ink_halftone.txt"))
    >>> len(ax.collections[0].get_offsets())
    31
    """
    _check(sheet, "sheet", Sheet, Report, Comparison)
    ax = _axes(ax, xlabel="a*", ylabel="b*")
    if isinstance(sheet, Comparison):
        lab = np.array([pair.sample.lab for pair in sheet.pairs])
        for pair in sheet.pairs:
            ax.plot(*zip(pair.reference.lab[1:], pair.sample.lab[1:]), color="0.4", zorder=3)
    else:
        lab = _lab(sheet)
        lab = lab[_coloured(lab, sheet)]
    corners = hull(lab[:, 1:])
    ax.plot(*zip(*corners, corners[0]), "--", color="0.6", zorder=1)
    ax.scatter(lab[:, 1], lab[:, 2], c=srgb(lab) / 255, edgecolors="0.5", zorder=2)
    ax.axhline(0, color="0.9", zorder=0)
    ax.axvline(0, color="0.9", zorder=0)
    ax.set_aspect("equal")
    return ax


def differences(
    comparison: Comparison, formula: Optional[str] = None, ax: Optional[Any] = None
) -> Any:
    """The difference of every pair from its aim, the largest first, in the deciding formula.

    A line shows the tolerance.

    Parameters
    ----------
    comparison : Comparison
    formula : str, optional
        One of the comparison's `formulas`; the first, which decides, by default.
    ax : matplotlib.axes.Axes, optional
        Where to draw; a new figure by default.

    Returns
    -------
    ax : matplotlib.axes.Axes

    Raises
    ------
    TypeError
        Where it is no Comparison.
    ValueError
        Where the comparison does not have the formula.

    Examples
    --------
    >>> from dataclasses import replace
    >>> aims = vantrel.read("examples/two_ink_halftone.txt")
    >>> darker = replace(aims, spectra=aims.spectra * np.linspace(0.9, 1, 31), file="darker")
    >>> ax = vantrel.plot.differences(vantrel.compare(aims, darker))
    >>> [round(float(bar.get_height()), 2) for bar in ax.patches[:2]]
    [2.61, 2.45]
    """
    _check(comparison, "comparison", Comparison)
    formula = formula or comparison.formulas[0]
    if formula not in comparison.formulas:
        raise ValueError(f"formula: {formula!r} is not one of {', '.join(comparison.formulas)}")
    ax = _axes(ax, xlabel="Pairs", ylabel=comparison.labels[formula])
    found = [(pair.delta_e[formula], pair.sample.lab) for pair in comparison.pairs]
    found = sorted(((d, lab) for d, lab in found if d is not None), reverse=True)
    colours = srgb([lab for _, lab in found]) / 255
    ax.bar(range(1, len(found) + 1), [d for d, _ in found], color=colours, edgecolor="0.5")
    if comparison.tolerance is not None and formula == comparison.formulas[0]:
        ax.axhline(comparison.tolerance, color="0.3", linestyle="--")
    return ax
