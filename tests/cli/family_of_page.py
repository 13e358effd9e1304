#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Prints the GEDCOM text that a page carries, or fields of what stands beside it.

Usage: family_of_page.py PAGE.html [FIELD ...]
"""

import base64
import gzip
import json
import re
import sys


def main():
    page = open(sys.argv[1], encoding="utf-8").read()
    block = re.search(r'<script type="application/json" id="olvane-family">([^<]*)</script>', page)
    family = json.loads(block.group(1))
    for field in sys.argv[2:]:
        print(family[field])
    if not sys.argv[2:]:
        sys.stdout.write(gzip.decompress(base64.b64decode(family["gzip"])).decode("utf-8"))


if __name__ == "__main__":
    main()
