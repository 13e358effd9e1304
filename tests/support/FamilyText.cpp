// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One pass over the text, character by character; what is read goes straight into the maps of a case.

#include <support/FamilyText.h>

#include <charconv>
#include <optional>
#include <stdexcept>

namespace support {

namespace {

struct Named {
    PersonId id;
    bool female;
};

class FamilyReader {
public:
    explicit FamilyReader(std::string_view source) : text(source) {}

    CaseFile read() {
        do readFamily();
        while (take(';'));
        if (at != text.size()) fail("unexpected character");
        return result;
    }

private:
    void readFamily() {
        const Named first = readPerson();
        if (!hasFocus) result.focus = first.id;
        hasFocus = true;
        std::optional<PersonId> father;
        std::optional<PersonId> mother;
        if (take('+')) {
            father = first.id;
            mother = readPerson().id;
            marry(*father, *mother);
        } else {
            (first.female ? mother : father) = first.id;
        }
        if (take(':')) readChildren(father, mother);
    }

    void readChildren(std::optional<PersonId> father, std::optional<PersonId> mother) {
        while (atPerson()) {
            const Named child = readPerson();
            if (father) {
                result.fathers[child.id] = *father;
                result.children[*father].push_back(child.id);
            }
            if (mother) {
                result.mothers[child.id] = *mother;
                result.children[*mother].push_back(child.id);
            }
        }
    }

    void marry(PersonId husband, PersonId wife) {
        result.sexes[wife] = 1;
        result.spouses[husband].push_back(wife);
        result.spouses[wife].push_back(husband);
    }

    Named readPerson() {
        if (!atPerson()) fail("a person's id is missing");
        PersonId id = 0;
        const char* const begin = text.data() + at;
        const auto [end, error] = std::from_chars(begin, text.data() + text.size(), id);
        if (error != std::errc()) fail("bad id");
        at += static_cast<std::size_t>(end - begin);
        const bool female = at < text.size() && text[at] == 'f';
        if (female) {
            ++at;
            result.sexes[id] = 1;
        }
        return {id, female};
    }

    bool atPerson() {
        skipSpaces();
        return at < text.size() && (text[at] == '-' || (text[at] >= '0' && text[at] <= '9'));
    }

    bool take(char wanted) {
        skipSpaces();
        if (at == text.size() || text[at] != wanted) return false;
        ++at;
        return true;
    }

    void skipSpaces() {
        while (at < text.size() && text[at] == ' ') ++at;
    }

    [[noreturn]] void fail(const std::string& reason) const {
        throw std::invalid_argument("family text, place " + std::to_string(at) + ": " + reason);
    }

    std::string_view text;
    std::size_t at = 0;
    bool hasFocus = false;
    CaseFile result;
};

}  // namespace

CaseFile family(std::string_view text) {
    return FamilyReader(text).read();
}

}  // namespace support
