"""Studies: many decks from one model."""

import collections
import concurrent.futures
import json
from typing import Any, Iterable, Iterator, Mapping, NamedTuple, Optional

from . import _qrx, _records
from ._errors import Finding


class StudyResult(NamedTuple):
    """What became of a row: its deck, or the errors that it failed with."""

    #: From 1.
    row: int
    name: str
    parameters: dict
    #: None where the row failed.
    deck: Optional[bytes]
    sha256: str
    seconds: float
    #: Those that the model has without any change are left out.
    findings: list
    errors: list

    @property
    def ok(self) -> bool:
        return self.deck is not None

    def write(self, path: Any) -> None:
        """Writes the deck to a path, which is replaced as a whole or not at all."""
        if self.deck is None:
            raise ValueError(f"row {self.row} failed: {self.errors[0]}")
        _qrx.replace_file(_records.file_path(path), "deck", self.deck)


def study(model: Any, rows: Iterable[Mapping[str, Any]], jobs: int = 2) -> Iterator[StudyResult]:
    """Makes a deck of the model for each row, and gives the results in the order of the rows.

    A row is a dict of values by JSON pointer into the model file that the model would make, such as
    "/models/Default Model/loads/F/states/Pull/component3"; "name" is a name for the result. A row that is wrong fails
    alone. Rows are taken as results are asked for: no more than a few for each of the `jobs` threads are at work.
    """
    from ._model import _file_of

    if jobs < 1:
        raise ValueError(f"found {jobs} jobs, expected 1 or more")
    return _results(_qrx.Study(_file_of([model])), iter(rows), jobs)


def _results(made, rows, jobs):
    numbered = enumerate(rows, 1)
    waiting = collections.deque()
    with concurrent.futures.ThreadPoolExecutor(jobs) as pool:
        try:
            while True:
                while len(waiting) < 4 * jobs and (next_row := next(numbered, None)) is not None:
                    waiting.append(pool.submit(made.make, next_row[0], dict(next_row[1])))
                if not waiting:
                    return
                yield _result_of(*waiting.popleft().result())
        finally:
            for future in waiting:
                future.cancel()


def _result_of(deck, line):
    told = json.loads(line)
    findings = [Finding(each["pointer"], each["text"], severity=each["severity"], code=each["code"], text=each["text"])
                for each in told["findings"]]
    errors = [Finding(each.get("pointer", each.get("column", "")), each["text"], text=each["text"])
              for each in told.get("error", [])]
    return StudyResult(told["row"], told.get("name", ""), told["parameters"], deck, told.get("sha256", ""),
                       told["seconds"], findings, errors)


for _each in (StudyResult, study):
    _each.__module__ = "qrx"
