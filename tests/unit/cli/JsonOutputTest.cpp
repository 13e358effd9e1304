// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// JSON that is written in pieces, against the library's own dump of the same values.

#include <cli/JsonOutput.h>

#include <algorithm>
#include <random>
#include <string>

#include <gtest/gtest.h>

namespace olvane::cli {
namespace {

using Json = nlohmann::ordered_json;

constexpr std::size_t kLong = 200'000;  // bytes; several pieces

std::string repeated(std::string_view text) {
    std::string all;
    while (all.size() < kLong) all += text;
    return all;
}

// Object and lists are opened and closed one by one, other values written whole.
void writeValue(const Json& value, JsonOutput& output) {
    if (value.is_string()) {
        output.text(std::string_view(value.get_ref<const std::string&>()));
    } else if (value.is_object()) {
        output.beginObject();
        for (const auto& [name, part] : value.items()) {
            output.key(name);
            writeValue(part, output);
        }
        output.endObject();
    } else if (value.is_array()) {
        output.beginList();
        for (const Json& part : value) writeValue(part, output);
        output.endList();
    } else {
        output.value(value);
    }
}

std::string written(const Json& value, JsonOutput::Form form) {
    std::string text;
    const picture::TextSink write = [&text](std::string_view piece) { text += piece; };
    JsonOutput output(write, form);
    writeValue(value, output);
    return text;
}

void expectAsTheLibrary(const Json& value) {
    constexpr auto kReplace = Json::error_handler_t::replace;
    ASSERT_EQ(written(value, JsonOutput::Form::indented), value.dump(1, ' ', false, kReplace));
    ASSERT_EQ(written(value, JsonOutput::Form::compact), value.dump(-1, ' ', false, kReplace));
}

Json randomValue(std::mt19937& random, int depth) {
    const auto kind = random() % (depth == 0 ? 4 : 6);
    if (kind == 0) return random();
    if (kind == 1) return random() % 2 == 0;
    if (kind == 2) return nullptr;
    if (kind == 3) return std::string(random() % 4, 'a') + "\"\\/\n\x01\x7f\xC3\xA9";
    Json parts = kind == 4 ? Json::array() : Json::object();
    for (auto i = random() % 4; i > 0; --i) {
        Json part = randomValue(random, depth - 1);
        if (kind == 4) {
            parts.push_back(std::move(part));
        } else {
            parts["n" + std::to_string(i)] = std::move(part);
        }
    }
    return parts;
}

TEST(JsonOutput, hasTheBytesOfTheLibrary) {
    std::mt19937 random(7);
    for (int i = 0; i < 2000; ++i) expectAsTheLibrary(randomValue(random, 4));
}

TEST(JsonOutput, movesAShortValueInToItsDepth) {
    const Json part = {{"list", {1, 2}}, {"none", Json::object()}};
    std::string text;
    const picture::TextSink write = [&text](std::string_view piece) { text += piece; };
    JsonOutput output(write, JsonOutput::Form::indented);
    output.beginObject();
    output.field("part", part);
    output.endObject();
    EXPECT_EQ(text, (Json{{"part", part}}).dump(1));
}

TEST(JsonOutput, cutsALongTextBetweenCharacters) {
    for (const char* character :
         {"a", "\xC3\xA9", "\xE5\xB0\x8F", "\xF0\x9F\x91\xB6", "\"", "a\xE5\xB0\x8F"}) {
        expectAsTheLibrary({{"text", repeated(character)}});
    }
}

TEST(JsonOutput, replacesBytesThatAreNoCharacter) {
    expectAsTheLibrary({{"file", "a\xFF.ged"}, {"\n", "\xC3"}});
    EXPECT_EQ(Json::parse(written(repeated("\x80"), JsonOutput::Form::compact)).get<std::string>().size(),
              3 * kLong);
}

// No piece is much longer than those that the text is cut into, so that none can be a copy of the whole.
TEST(JsonOutput, holdsNoCopyOfALongText) {
    std::size_t longest = 0;
    const picture::TextSink write = [&longest](std::string_view piece) {
        longest = std::max(longest, piece.size());
    };
    JsonOutput output(write, JsonOutput::Form::compact);
    output.text(std::string_view(repeated("\"")));
    EXPECT_LT(longest, kLong);
    EXPECT_GT(longest, 0U);
}

}  // namespace
}  // namespace olvane::cli
