// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/host/LayoutText.h>

#include "MadeLayout.h"

namespace bench {

// A question that a layout asked of its host, to be asked again.
struct HostQuestion {
    enum class Kind : std::uint8_t { father, mother, spouses, children, preferred, dead, date, sex };
    Kind kind;
    bool isBirth;  // of a date
    std::int64_t personId;
    std::int64_t spouseId;  // of a preferred spouse
};

// The least that any layout of a family can cost: the very questions that our layout asks, asked of the same
// host in the same order, and the same text written from numbers that are already there. Nothing stands in
// between.
//
// Holds: text() equals the layout's text; the constructor lays out once to learn both.
class Floor {
public:
    explicit Floor(const MadeLayout& layout);

    // Asks all questions, then writes.
    std::string text() const;

    const std::vector<HostQuestion>& questions() const { return questions_; }
    // A sum over all answers of the last text(), so that no answer goes unread.
    std::int64_t answers() const { return answers_; }

private:
    std::shared_ptr<OlvaneViewerManagerWrapProtocol> source_;
    std::vector<HostQuestion> questions_;
    std::vector<olvane::LayoutRecord> records_;
    mutable std::int64_t answers_ = 0;
};

}  // namespace bench
