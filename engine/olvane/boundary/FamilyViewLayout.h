// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>
#include <string>

#include <olvane/Export.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

// Lays out the family view around one person and returns it as one line of text, in the form that
// ResultWriter.cpp defines: a record for each person, in the order of the walk.
//
// personText is the decimal form of the host's id of the focus. The data source is held for the whole call.
// Fails: never because of the data or the host. Whatever goes wrong in the layout leaves the text written so
//        far, usually the empty one. Memory that runs out before or after the layout throws std::bad_alloc.
// Threads: several calls may run at once, each with a data source of its own or one that is safe to share.
// Nested: an operation of the data source may call this too. The two count unknown parents in one sequence, which the inner
//         call starts again, so the outer one's later unknown parents have other ids than without it. Typed layouts
//         (TypedLayout.h) leave the sequence of an outer call alone.
OLVANE_API std::string FamilyViewLayout(std::string personText,
                                        std::shared_ptr<OlvaneViewerManagerWrapProtocol> manager);
