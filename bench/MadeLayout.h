// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include <olvane/boundary/OlvaneViewerManagerWrapProtocol.h>
#include <olvane/boundary/TypedLayout.h>

#include "MadeFamily.h"

namespace bench {

// One layout that is timed or counted: a made family and the view that shows it.
//
//   shape  family                      view      size
//   desc   MadeFamily::descendants     family    persons
//   ego    MadeFamily::kin             family    persons
//   ped    MadeFamily::ancestors       pedigree  generations above the focus, all of them shown
//
// Fails: the constructor throws std::invalid_argument for another shape.
class MadeLayout {
public:
    MadeLayout(std::string shape, int size);

    // The whole way from the focus's id to the result text.
    std::string text() const { return textFrom(source_); }
    // The same, with the questions asked of another data source.
    std::string textFrom(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source) const;

    // The same with a typed layout beside the text.
    olvane::TypedLayout typed(bool withText = true) const;

    std::string name() const { return shape_ + " " + std::to_string(size_); }
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source() const { return source_; }
    std::size_t persons() const { return persons_; }

private:
    std::string shape_;
    int size_;
    std::size_t persons_;
    std::shared_ptr<OlvaneViewerManagerWrapProtocol> source_;
};

// Throws std::invalid_argument for a shape that is none of the three.
MadeFamily madeFamily(std::string_view shape, int size);

// The families of the tables: 30 to 10,000 persons in both shapes of the family view, 4 to 12 generations.
struct LayoutName {
    const char* shape;
    int size;
};
const std::vector<LayoutName>& layoutsOfTheTables();

// The different persons of a result text who are the host's own; boxes of unknown parents are left out.
std::size_t shownPersons(const std::string& text);

}  // namespace bench
