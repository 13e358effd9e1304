// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lines of detail as what they say. A record of lines is a tree in the order of its levels, so each reader takes the
// lines below the one in hand off the front; nothing calls itself, since no source or note is followed further than to
// the record that it points to.

#include <olvane/gedcom/GedcomDetails.h>

#include <algorithm>

#include <olvane/gedcom/TagCodeInternal.h>

namespace olvane::gedcom {
namespace {

using Lines = std::span<const DetailLine>;

void setFirst(std::string_view& value, std::string_view text) {
    if (value.empty()) value = text;
}

bool isMedium(std::uint64_t tag) {
    return tag == tagCode("OBJE");
}

class DetailReader {
public:
    explicit DetailReader(const GedcomData& data) : data_(data) {}

    // The trees of that level; those of other levels belong to somebody else.
    Details read(Lines lines, std::uint8_t level) {
        while (!lines.empty()) {
            const Lines tree = takeDetailTree(lines);
            if (tree.front().level == level) readTree(tree);
        }
        return std::move(details_);
    }

private:
    void readTree(Lines tree) {
        const DetailLine& line = tree.front();
        switch (tagCode(line.tag)) {
            case tagCode("NOTE"):
            case tagCode("SNOTE"):
                return addNote(line);
            case tagCode("SOUR"):
                return addCitation(tree);
            case tagCode("OBJE"):
                return addMedia(tree);
            case tagCode("WWW"):
            case tagCode("URL"):
            case tagCode("_URL"):
            case tagCode("_LINK"):
            case tagCode("_WEBTAG"):
                return addLinks(tree);
            case tagCode("ADDR"):
                return readAddress(tree);
            case tagCode("TYPE"):
                return setFirst(details_.type, line.value);
            case tagCode("CAUS"):
                return setFirst(details_.cause, line.value);
            case tagCode("AGE"):
                return setFirst(details_.age, line.value);
            case tagCode("HUSB"):
                return setFirst(details_.husbandAge, valueBelow(tree, tagCode("AGE")));
            case tagCode("WIFE"):
                return setFirst(details_.wifeAge, valueBelow(tree, tagCode("AGE")));
            case tagCode("AGNC"):
                return setFirst(details_.agency, line.value);
            default:
                return;
        }
    }

    // The value of the first line of that tag anywhere below; empty if there is none.
    static std::string_view valueBelow(Lines tree, std::uint64_t tag) {
        for (const DetailLine& line : tree.subspan(1)) {
            if (tagCode(line.tag) == tag && !line.isPointer) return line.value;
        }
        return {};
    }

    void addNote(const DetailLine& line) {
        std::string_view text = line.value;
        if (line.isPointer) {
            const SharedRecord* const note = data_.sharedByXref(line.value);
            text = note == nullptr ? std::string_view() : note->value;
        }
        if (!text.empty()) details_.notes.push_back(text);
    }

    void addCitation(Lines tree) {
        const DetailLine& line = tree.front();
        Citation citation;
        citation.line = line.line;
        if (!line.isPointer) citation.title = line.value;
        const SharedRecord* const source = line.isPointer ? data_.sharedByXref(line.value) : nullptr;
        if (line.isPointer && source == nullptr) return;
        if (source != nullptr) readSource(*source, citation);
        citation.page = valueBelow(tree, tagCode("PAGE"));
        citation.text = valueBelow(tree, tagCode("TEXT"));
        const std::string_view quality = valueBelow(tree, tagCode("QUAY"));
        if (quality.size() == 1 && quality[0] >= '0' && quality[0] <= '3')
            citation.quality = quality[0] - '0';
        details_.citations.push_back(citation);
        readMediaBelow(tree);
    }

    void readSource(const SharedRecord& source, Citation& citation) const {
        std::string_view shortTitle;
        for (const DetailLine& line : data_.detailsOfShared(source)) {
            if (line.level != 1) continue;
            const std::uint64_t tag = tagCode(line.tag);
            if (tag == tagCode("TITL")) setFirst(citation.title, line.value);
            if (tag == tagCode("ABBR")) setFirst(shortTitle, line.value);
            if (tag == tagCode("AUTH")) setFirst(citation.author, line.value);
            if (tag == tagCode("PUBL")) setFirst(citation.publication, line.value);
        }
        setFirst(citation.title, shortTitle);
    }

    void readMediaBelow(Lines tree) {
        Lines below = tree.subspan(1);
        while (!below.empty()) {
            const Lines part = takeDetailTree(below);
            if (isMedium(tagCode(part.front().tag))) addMedia(part);
        }
    }

    void addMedia(Lines tree) {
        const DetailLine& line = tree.front();
        const std::string_view title = valueBelow(tree, tagCode("TITL"));
        if (!line.isPointer) return addFiles(tree.subspan(1), title);
        const SharedRecord* const record = data_.sharedByXref(line.value);
        if (record != nullptr) addFiles(data_.detailsOfShared(*record), title);
    }

    // FORM and TITL stand below a FILE, or beside it in older files.
    void addFiles(Lines lines, std::string_view title) {
        MediaFile shared;
        shared.title = title;
        const std::size_t first = details_.media.size();
        for (const DetailLine& line : lines) {
            const std::uint64_t tag = tagCode(line.tag);
            MediaFile& medium =
                details_.media.size() > first && line.level > fileLevel_ ? details_.media.back() : shared;
            if (tag == tagCode("FILE") && !line.value.empty()) {
                details_.media.push_back({{}, line.value, {}});
                fileLevel_ = line.level;
            }
            if (tag == tagCode("FORM")) setFirst(medium.format, line.value);
            if (tag == tagCode("TITL")) setFirst(medium.title, line.value);
        }
        for (MediaFile& medium : std::span(details_.media).subspan(first)) {
            setFirst(medium.title, shared.title);
            setFirst(medium.format, shared.format);
        }
    }

    // A link's own line has the address, or a line below it has.
    void addLinks(Lines tree) {
        for (const DetailLine& line : tree) {
            const bool isAddress = &line == &tree.front() || isWebAddress(line.value);
            if (isAddress && !line.value.empty() && !line.isPointer) details_.links.push_back(line.value);
        }
    }

    // The pieces repeat what the address says; they stand in for it where it is empty.
    void readAddress(Lines tree) {
        if (!details_.address.empty()) return;
        details_.address = tree.front().value;
        if (!details_.address.empty()) return;
        for (const DetailLine& line : tree.subspan(1)) {
            if (line.isPointer || line.value.empty()) continue;
            if (!details_.address.empty()) details_.address += '\n';
            details_.address += line.value;
        }
    }

    const GedcomData& data_;
    Details details_;
    std::uint8_t fileLevel_ = 0;
};

}  // namespace

std::span<const DetailLine> takeDetailTree(std::span<const DetailLine>& rest) {
    const DetailLine& top = rest.front();
    std::size_t size = 1;
    while (size < rest.size() && rest[size].level > top.level && rest[size].isOfPart == top.isOfPart) ++size;
    const Lines tree = rest.first(size);
    rest = rest.subspan(size);
    return tree;
}

bool Details::isEmpty() const {
    return type.empty() && cause.empty() && age.empty() && husbandAge.empty() && wifeAge.empty() &&
           agency.empty() && address.empty() && notes.empty() && citations.empty() && media.empty() &&
           links.empty();
}

Details personDetails(const GedcomData& data, PersonId id) {
    return DetailReader(data).read(data.detailsOfPerson(id), 1);
}

Details familyDetails(const GedcomData& data, FamilyId id) {
    return DetailReader(data).read(data.detailsOfFamily(id), 1);
}

Details factDetails(const GedcomData& data, const Fact& fact) {
    return DetailReader(data).read(data.detailsOfFact(fact), 2);
}

Details nameDetails(const GedcomData& data, const PersonName& name) {
    return DetailReader(data).read(data.detailsOfName(name), 2);
}

bool isWebAddress(std::string_view address) {
    const auto beginsWith = [&address](std::string_view scheme) {
        return address.size() > scheme.size() &&
               std::equal(scheme.begin(), scheme.end(), address.begin(), [](char wanted, char c) {
                   return wanted == (c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c);
               });
    };
    return beginsWith("http://") || beginsWith("https://");
}

}  // namespace olvane::gedcom
