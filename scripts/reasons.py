"""Lists beside the scripts, of lines "FILE: TEXT  -- REASON": what was looked at once and need not be again."""


def known(path):
    """The files and texts of a list; none where it isn't there."""
    pairs = set()
    if path.exists():
        for line in path.read_text().splitlines():
            if line and not line.startswith("#"):
                name, _, text = line.split("  -- ")[0].partition(": ")
                pairs.add((name, text.strip()))
    return pairs
