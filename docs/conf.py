"""How Sphinx makes the manual; scripts/build-docs.sh runs it on a copy of this folder with what is generated."""

import os
import pathlib
import re
import sys

HERE = pathlib.Path(__file__).resolve().parent
sys.path.insert(0, str(HERE))

from deck_lexer import DeckLexer, JsonLexer  # noqa: E402

ROOT = HERE.parent
VERSION = re.search(r"project\(\w+ VERSION ([\d.]+)", (ROOT / "CMakeLists.txt").read_text(encoding="utf-8"))[1]

project = "qrxdeck"
author = "The authors of qrxdeck"
copyright = "its authors; the licence is not yet chosen"
version = release = VERSION
language = "en"

extensions = ["myst_parser", "breathe"]
if os.environ.get("QRX_DOCS_SPELLING"):
    extensions.append("sphinxcontrib.spelling")
exclude_patterns = ["README.md"]
suppress_warnings = ["myst.header"]
myst_enable_extensions = ["deflist"]
myst_heading_anchors = 4
nitpicky = False

breathe_projects = {"qrx": os.environ.get("QRX_DOXYGEN_XML", "")}
breathe_default_project = "qrx"
breathe_default_members = ("members",)
breathe_domain_by_extension = {"h": "cpp"}

html_theme = "furo"
html_title = f"qrxdeck {VERSION}"
html_static_path = ["_static"]
html_css_files = ["manual.css"]
html_copy_source = False
html_show_sourcelink = False
html_show_sphinx = False

# Nothing beyond the site is asked for: there may be no network.
linkcheck_ignore = [r"https?://.*"]

spelling_lang = "en_GB"
spelling_word_list_filename = "spelling.txt"
spelling_filters = ["spelling_filter.Names"]
spelling_show_suggestions = False
spelling_ignore_contributor_names = False


def without_modules(app, pagename, templatename, context, doctree):
    """Debian's theme has its script as a module, which browsers don't take from disk; the pages do without."""
    context["script_files"] = [file for file in context.get("script_files", []) if "furo.js" not in str(file)]


def without_outside(app, exception):
    """Debian's theme takes a style sheet from a web server's folder."""
    sheet = pathlib.Path(app.outdir) / "_static" / "styles" / "furo.css"
    if sheet.exists():
        sheet.write_text(re.sub(r"@import[^;]*;", "", sheet.read_text(encoding="utf-8")), encoding="utf-8")


def setup(app):
    app.add_lexer("inp", DeckLexer)
    app.add_lexer("json", JsonLexer)
    app.add_lexer("jsonl", JsonLexer)
    # Behind the theme's own, which adds the script.
    app.connect("html-page-context", without_modules, priority=900)
    app.connect("build-finished", without_outside)
