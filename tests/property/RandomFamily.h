// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <rapidcheck.h>

#include <support/CaseFile.h>

namespace property {

// Families of up to a given size with a request for one of them. Three kinds are mixed: families as they
// are, families whose data contradict each other (a child that does not name its parent, a man as mother, a
// person who is their own ancestor, lists that repeat a person), and both at once.
rc::Gen<support::CaseFile> consistentFamily(int mostPersons);
rc::Gen<support::CaseFile> contradictoryFamily(int mostPersons);
rc::Gen<support::CaseFile> anyFamily(int mostPersons);

// The same with options, sizes of every kind, the bare adapter, the pedigree view, and ids that are huge or
// below 1.
rc::Gen<support::CaseFile> anyRequest(int mostPersons);

}  // namespace property
