// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <olvane.h>

// What the module asks of JavaScript, and how JavaScript answers.
//
// Units: ids are doubles here, since JavaScript has no other numbers; it passes whole ones only.
namespace olvane::js {

// A data source whose questions JavaScript answers for the layout that is running: its functions keep what the
// host threw and report a failure.
olvane_host hostOfJavaScript();

}  // namespace olvane::js
