"""The smallest model that the tests of the program write and change: one rigid link."""

import copy

MODEL = {
    "format": "qrx-model/1",
    "models": {
        "Default Model": {
            "topLevelSolverInput": ["*Heading", "One rigid link"],
            "parts": {
                "ROD": {
                    "mesh": {
                        "nodes": {"labels": [1, 2], "coordinates": [[0, 0, 0], [2.5, 0, 0]]},
                        "elements": [{"type": "R2D2", "labels": [1], "connectivity": [[1, 2]]}],
                        "sets": [{"name": "TIP", "kind": "node", "labels": [2]}],
                    }
                }
            },
            "assembly": {"instances": {"ROD-1": {"part": "ROD", "translation": [0, 1, 0]}}},
            "steps": [{"name": "Initial", "class": "InitialStep"}],
        }
    },
}


def changed(change):
    """The model with a change made to its default model."""
    model = copy.deepcopy(MODEL)
    change(model["models"]["Default Model"])
    return model
