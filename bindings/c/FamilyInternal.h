// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane_family.h>

#include <olvane/kin/Family.h>
#include <olvane/kin/FamilyDataSource.h>

// The opaque family is the library's own table.
struct olvane_family {
    olvane::Family table;
};
