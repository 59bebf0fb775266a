"""Colours for what the manual shows: decks, and JSON with comments and left-out parts."""

from pygments.lexer import RegexLexer, bygroups
from pygments.lexers import JavascriptLexer
from pygments.token import Comment, Keyword, Name, Number, Punctuation, String, Text


class DeckLexer(RegexLexer):
    name = "keyword deck"
    aliases = ["inp"]
    tokens = {
        "root": [
            (r"^\*\*.*$", Comment),
            (r"^(\*[A-Za-z][^,\n]*)", Keyword, "parameters"),
            (r'"[^"\n]*"', String),
            (r"[-+]?\d[\d.]*(?:[eE][-+]?\d+)?(?![\w-])", Number),
            (r"[,=]", Punctuation),
            (r"[^\s,\"*]+", Text),
            (r"\s+|\*", Text),
        ],
        "parameters": [
            (r"\n", Text, "#pop"),
            (r"(,\s*)([A-Za-z][^=,\n]*)", bygroups(Punctuation, Name.Attribute)),
            (r'=\s*"[^"\n]*"', String),
            (r"=[^,\n]*", String),
            (r"[^\n]", Text),
        ],
    }


class JsonLexer(JavascriptLexer):
    name = "JSON with comments"
    aliases = ["json"]
