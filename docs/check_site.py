#!/usr/bin/env python3
"""Follows every link of a built site within the site: files are there, and so are the places in them.

usage: check_site.py FOLDER
"""

import html.parser
import pathlib
import sys
import urllib.parse


class Page(html.parser.HTMLParser):
    def __init__(self, text):
        super().__init__()
        self.places, self.links = set(), []
        self.feed(text)

    def handle_starttag(self, tag, attributes):
        for name, value in attributes:
            if name in ("id", "name") and value:
                self.places.add(value)
            elif name in ("href", "src") and value:
                self.links.append(value)


def main():
    folder = pathlib.Path(sys.argv[1]).resolve()
    pages = {path: Page(path.read_text(encoding="utf-8")) for path in folder.rglob("*.html")}
    wrong, followed = set(), 0
    for path, page in pages.items():
        for link in page.links:
            parts = urllib.parse.urlsplit(link)
            if parts.scheme in ("http", "https", "mailto", "data"):
                # Nothing of the site may need a network to be shown; links that are followed by hand may.
                continue
            followed += 1
            target = (path.parent / urllib.parse.unquote(parts.path)).resolve() if parts.path else path
            if target.is_dir():
                target /= "index.html"
            if not target.exists():
                wrong.add(f"{path.relative_to(folder)}: no file for {link}")
            elif parts.fragment and target in pages and urllib.parse.unquote(parts.fragment) not in pages[target].places:
                wrong.add(f"{path.relative_to(folder)}: no place for {link}")
    print("\n".join(sorted(wrong)))
    print(f"{len(pages)} pages, {followed} links within the site, {len(wrong)} wrong")
    return 1 if wrong or not pages else 0


if __name__ == "__main__":
    sys.exit(main())
