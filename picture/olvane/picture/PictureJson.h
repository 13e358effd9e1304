// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <functional>
#include <string>

#include <olvane/picture/Picture.h>
#include <olvane/picture/TextSink.h>

namespace olvane::picture {

// What a data source adds to the numbers of a picture. A question that is not set adds nothing.
struct PictureFacts {
    // Writes a JSON object about the person, or nothing.
    std::function<void(std::int64_t id, const TextSink& write)> person;
    // The data source's name of a family, and what stands at its marriage line; UTF-8, or the empty text.
    std::function<std::string(std::uint32_t number)> familyXref;
    std::function<std::string(std::uint32_t number)> familyLabel;
};

// A picture as JSON, format 2: docs/picture.schema.json describes it.
//
// Holds: the same picture and facts give the same bytes everywhere; numbers have at most three decimals; the
//        text ends with a line feed.
// Fails: whatever a question or the sink throws passes on.
void writePictureJson(const Picture& picture, const PictureFacts& facts, const TextSink& write);

// The same as one text.
std::string pictureJson(const Picture& picture, const PictureFacts& facts = PictureFacts());

}  // namespace olvane::picture
