// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// From a host's numeric id to a layout.

#include <olvane/boundary/OlvaneViewerBridge.h>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/HostText.h>

#include <utility>

OlvaneViewerBridge::OlvaneViewerBridge(std::shared_ptr<OlvaneViewerManagerWrapProtocol> manager)
    : _manager(std::move(manager)) {}

OlvaneViewerBridge OlvaneViewerBridge::initWithManagerWrap(
    std::shared_ptr<OlvaneViewerManagerWrapProtocol> manager) {
    return OlvaneViewerBridge(std::move(manager));
}

std::string OlvaneViewerBridge::valuesForPersonId(std::int64_t personId) const {
    const auto lowBits = static_cast<std::uint32_t>(static_cast<std::uint64_t>(personId));
    return FamilyViewLayout(intToString(static_cast<int>(lowBits)), _manager);
}
