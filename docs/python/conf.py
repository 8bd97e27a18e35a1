"""The pages of the Python package: scripts/docs python."""

import inspect
from pathlib import Path

import vantrel

project = "Vantrel"
author = "Vantrel"
release = vantrel.__version__
extensions = ["myst_nb", "sphinx.ext.autodoc", "sphinx.ext.napoleon"]
html_theme = "alabaster"
html_theme_options = {"description": "Colour measurement for the graphic arts", "page_width": "70em"}
autodoc_typehints = "none"  # the docstrings have them
autodoc_member_order = "bysource"
autodoc_default_options = {"members": True, "undoc-members": False}
napoleon_google_docstring = False
napoleon_use_ivar = True
napoleon_use_rtype = False
nb_execution_mode = "force"
nb_execution_raise_on_error = True
nb_execution_timeout = 300

SUBJECTS = {
    "Sheets": "_sheet _judge _results _predictions _ink _run",
    "Colours": "_colour",
    "Differences": "_difference",
    "Densities": "_density",
    "Print": "_print",
    "Polarisation": "_polarisation",
    "Paper": "_paper",
    "Inks": "_inks",
    "Settings": "_constants _ufuncs",
    "Names and wavelengths": "_enums _resample",
}


def write_reference(app):
    """A page for each subject, with all that the package offers."""
    folder = Path(app.srcdir) / "reference"
    folder.mkdir(exist_ok=True)
    left = [name for name in vantrel.__all__ if callable(getattr(vantrel, name))]
    for title, modules in SUBJECTS.items():
        names = [n for n in left if getattr(vantrel, n).__module__[8:] in modules.split()]
        left = [name for name in left if name not in names]
        lines = [title, "=" * len(title), "", ".. currentmodule:: vantrel", ""]
        for name in names:
            kind = "class" if inspect.isclass(getattr(vantrel, name)) else "function"
            lines.append(f".. auto{kind}:: {name}")
        (folder / f"{title.split()[0].lower()}.rst").write_text("\n".join(lines) + "\n")
    (folder / "figures.rst").write_text("Figures\n=======\n\n.. automodule:: vantrel.plot\n")
    assert not left, left


def setup(app):
    app.connect("builder-inited", write_reference)
