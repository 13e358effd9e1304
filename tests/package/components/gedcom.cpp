// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file of two persons, as the engine's data source.

#include <iostream>
#include <memory>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/source/GedcomSource.h>

int main() {
    const auto data = olvane::gedcom::readGedcomBytes(
        "0 HEAD\n0 @I1@ INDI\n1 NAME Ada /King/\n1 FAMC @F1@\n0 @I2@ INDI\n1 FAMS @F1@\n0 @F1@ FAM\n1 HUSB "
        "@I2@\n"
        "1 CHIL @I1@\n0 TRLR\n",
        "here.ged");
    std::cout << FamilyViewLayout("1", std::make_shared<olvane::gedcom::GedcomDataSource>(data)) << "\n";
}
