// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

#include <olvane_picture.h>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/charts/Views.h>

namespace olvane::c {

olvane_options defaultOptions();

// The options of a host as the engine takes them.
LayoutOptions layoutOptionsOf(const olvane_options& options);

bool areInRange(const olvane_options& options);

// The name of the first field that is out of its range; null where all are in theirs.
const char* refusedOption(const olvane_picture_options& options);

inline bool areInRange(const olvane_picture_options& options) {
    return refusedOption(options) == nullptr;
}

// Everything at its usual value.
void setDefaults(olvane_picture_options& options);

// The fields that are options of a request, in the order of a list, with what the table of options says of each.
std::size_t optionCount();
void describeOption(std::size_t index, olvane_picture_option& option);
const char* wordOfOption(std::size_t index, std::size_t word);

// Whether a number is one of an enumeration that counts from 0.
constexpr bool isOneOf(std::int32_t number, std::int32_t count) {
    return number >= 0 && number < count;
}

// The request that the options of a picture ask for, but for focus, other and earlier picture, and the folds and sizes that it refers to.
// A number of no enumeration stays one, so that the check of the request refuses it.
struct AskedView {
    explicit AskedView(const olvane_picture_options& options);
    AskedView(const AskedView&) = delete;
    AskedView& operator=(const AskedView&) = delete;

    std::vector<charts::Fold> folds;
    std::vector<charts::SizedBox> boxSizes;
    charts::ViewRequest request;
};

}  // namespace olvane::c
