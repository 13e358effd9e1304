// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <memory>
#include <string>

#include <olvane/Export.h>
#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>

// What a host makes once with its data source and asks for layouts. It holds the data source and nothing
// else: each call is a whole layout, independent of the others.
class OLVANE_API OlvaneViewerBridge {
public:
    static OlvaneViewerBridge initWithManagerWrap(std::shared_ptr<OlvaneViewerManagerWrapProtocol> manager);

    // The family view around that person. Only the low 32 bits of the id count; an id that is then below 1
    // gives the empty text. Fails as FamilyViewLayout does.
    std::string valuesForPersonId(std::int64_t personId) const;

private:
    explicit OlvaneViewerBridge(std::shared_ptr<OlvaneViewerManagerWrapProtocol> manager);

    std::shared_ptr<OlvaneViewerManagerWrapProtocol> _manager;
};
