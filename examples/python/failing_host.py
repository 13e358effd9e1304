# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A database that breaks down in the middle of a layout, and what its program learns of that."""

import first_tree
import olvane


class BrokenFamily(first_tree.MyFamily):
    def children_of(self, person: int) -> list[int]:
        raise ConnectionError("the database is closed")


try:
    olvane.layout(BrokenFamily(), 1)
except olvane.HostError as error:
    print(f"{error.status.name}, {len(error.records)} records: {error.__cause__}")
