# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The example of a family behind a network: few batches, nobody twice, and at last the picture of the whole family."""

import unittest

import near_first
import olvane


def everybody() -> dict[int, near_first.Row]:
    """Twelve generations of couples with two children each, one of whom marries."""
    rows = {1: near_first.Row(1)}
    for heir in range(1, 37, 3):
        partner, other, following = heir + 1, heir + 2, heir + 3
        rows[heir] = rows[heir]._replace(spouses=(partner,), children=(following, other))
        rows[partner] = near_first.Row(partner, spouses=(heir,), children=(following, other))
        for child in (following, other):
            rows[child] = near_first.Row(child, heir, partner)
    return rows


class NearFirst(unittest.TestCase):
    def test_aFamilyBehindANetworkComesInRings(self) -> None:
        rows, batches = everybody(), []

        def ask(ids: list[int]) -> list[near_first.Row]:
            batches.append(ids)
            return [rows[person] for person in ids]

        texts = [olvane.layout_text(family, 19) for family in near_first.near_first(ask, 19)]
        asked = [person for batch in batches for person in batch]
        self.assertEqual(6, len(batches))
        self.assertEqual([19], batches[0])
        self.assertEqual(len(set(asked)), len(asked))
        self.assertLess(len(asked), len(rows))
        self.assertEqual(olvane.layout_text(near_first.table_of(rows), 19), texts[-1])
        self.assertNotEqual(texts[0], texts[-1])


if __name__ == "__main__":
    unittest.main()
