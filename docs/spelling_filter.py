"""What the spelling of the manual passes over: names of fields, classes and quantities."""

import re

import enchant.tokenize


class Names(enchant.tokenize.Filter):
    """Words with capitals within them (timePeriod, RF, kprC)."""

    def _skip(self, word):
        return re.search(r"\w[A-Z]|\d", word) is not None
