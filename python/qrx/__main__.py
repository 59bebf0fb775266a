"""The command line: python -m qrx write model.json."""

import sys

from . import _qrx


def main():
    sys.stdout.flush()
    sys.stderr.flush()
    sys.exit(_qrx.run_program(["qrxdeck", *sys.argv[1:]]))


if __name__ == "__main__":
    main()
