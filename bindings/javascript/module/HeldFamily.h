// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <memory>
#include <optional>

#include <olvane/kin/Family.h>
#include <olvane/kin/FamilyDataSource.h>
#include <olvane/kin/PersonIndex.h>

namespace olvane::js {

// A family, with what is made of it when somebody first asks: itself as a data source, and its index.
struct HeldFamily {
    Family table;
    std::shared_ptr<OlvaneViewerManagerWrapProtocol> source{};
    std::optional<kin::PersonIndex> personIndex{};

    const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& asSource() {
        if (!source) source = std::make_shared<FamilyDataSource>(table);
        return source;
    }

    const kin::PersonIndex& index() {
        if (!personIndex) personIndex.emplace(table);
        return *personIndex;
    }

    void forgetWhatWasMade() {
        source.reset();  // which shares the table's rows
        personIndex.reset();
    }
};

}  // namespace olvane::js
