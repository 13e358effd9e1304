// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Writes JSON by hand: the same bytes from every compiler, and no library to load in a browser.

#include <olvane/picture/PictureJson.h>

#include <array>
#include <cmath>
#include <cstdint>
#include <string_view>

#include <olvane/kin/KinJson.h>
#include <olvane/picture/PictureNames.h>

namespace olvane::picture {

namespace {

using kin::jsonText;

// Points in thousandths. A cell in ring 25 may have a hundred-thousandth of a degree, so angles have more decimals.
constexpr std::int64_t kPartsOfPoint = 1000;
constexpr std::int64_t kPartsOfDegree = 1'000'000'000'000;
constexpr double kMostParts = 9e18;
constexpr std::size_t kPieceBytes = 64 * 1024;

// Rounded to such parts of one, a power of ten, without trailing zeros; what is not finite is 0.
std::string numberIn(double value, std::int64_t partsOfOne) {
    const double parts = std::round(value * static_cast<double>(partsOfOne));
    if (!(std::abs(parts) < kMostParts)) return "0";
    const auto whole = static_cast<std::int64_t>(parts);
    const std::int64_t positive = whole < 0 ? -whole : whole;
    std::string text = (whole < 0 ? "-" : "") + std::to_string(positive / partsOfOne);
    std::string decimals = std::to_string(positive % partsOfOne + partsOfOne).substr(1);
    while (!decimals.empty() && decimals.back() == '0') decimals.pop_back();
    return decimals.empty() ? text : text + "." + decimals;
}

std::string number(double value) {
    return numberIn(value, kPartsOfPoint);
}

template <class Values, class Text>
std::string listOf(const Values& values, Text text) {
    std::string json = "[";
    for (const auto& value : values) {
        if (json.size() > 1) json += ", ";
        json += text(value);
    }
    return json + "]";
}

std::string placesJson(std::span<const Index> places) {
    return listOf(places, [](Index place) { return std::to_string(place); });
}

std::string field(std::string_view name, double value) {
    return ", \"" + std::string(name) + "\": " + number(value);
}

std::string angle(std::string_view name, double degrees) {
    return ", \"" + std::string(name) + "\": " + numberIn(degrees, kPartsOfDegree);
}

class PictureWriter {
public:
    PictureWriter(const Picture& picture, const PictureFacts& facts, const TextSink& sink)
        : picture_(picture), facts_(facts), sink_(sink) {}

    void write() {
        const std::int64_t focus =
            picture_.focus == kNone ? 0 : picture_.boxes[static_cast<std::size_t>(picture_.focus)].id;
        json_ = "{\n \"format\": 2,\n \"view\": " + jsonText(picture_.view) +
                ",\n \"focus\": " + std::to_string(focus) + ",\n";
        if (picture_.isRound()) {
            json_ += " \"rings\": " + listOf(picture_.ringRadii, number) +
                     field("middleX", picture_.middleX) + field("middleY", picture_.middleY) + ",\n";
        }
        addList("boxes", picture_.boxes.size(), [this](std::size_t i) { addBox(i); });
        json_ += ",\n";
        addList("families", picture_.families.size(),
                [this](std::size_t i) { json_ += familyJson(picture_.families[i]); });
        json_ += ",\n";
        addList("marks", picture_.marks.size(),
                [this](std::size_t i) { json_ += markJson(picture_.marks[i]); });
        if (!picture_.folded.empty()) {
            json_ += ",\n";
            addList("folded", picture_.folded.size(),
                    [this](std::size_t i) { json_ += foldedJson(picture_.folded[i]); });
        }
        if (picture_.other != kNone) {
            json_ += ",\n \"other\": " +
                     std::to_string(picture_.boxes[static_cast<std::size_t>(picture_.other)].id) +
                     ",\n \"focusIs\": " + jsonText(picture_.focusIs) +
                     ",\n \"otherIs\": " + jsonText(picture_.otherIs) + ",\n";
            addList("ways", picture_.ways.size(),
                    [this](std::size_t i) { json_ += wayJson(picture_.ways[i]); });
        }
        json_ += "\n}\n";
        flush();
    }

private:
    template <class Entry>
    void addList(std::string_view name, std::size_t count, Entry addEntry) {
        json_ += " " + jsonText(name) + ": [";
        for (std::size_t i = 0; i < count; ++i) {
            json_ += i == 0 ? "\n  " : ",\n  ";
            addEntry(i);
            if (json_.size() >= kPieceBytes) flush();
        }
        json_ += count == 0 ? "]" : "\n ]";
    }

    void flush() {
        sink_(json_);
        json_.clear();
    }

    void addBox(std::size_t i) {
        const Box& box = picture_.boxes[i];
        json_ += placeOfBox(i);
        if (box.kind != BoxKind::unknownParent) {
            json_ += personFields(box);
            addPerson(box.id);
        }
        json_ += '}';
    }

    // What a data source writes may be long, so it goes past this writer's own text.
    void addPerson(std::int64_t id) {
        if (!facts_.person) return;
        bool isFirst = true;
        facts_.person(id, [&](std::string_view piece) {
            if (piece.empty()) return;
            if (isFirst) json_ += ", \"person\": ";
            isFirst = false;
            if (json_.size() + piece.size() < kPieceBytes) {
                json_ += piece;
                return;
            }
            flush();
            sink_(piece);
        });
    }

    std::string placeOfBox(std::size_t i) const {
        const Box& box = picture_.boxes[i];
        std::string json = "{\"id\": " + std::to_string(box.id) + ", \"kind\": " + jsonText(nameOf(box.kind));
        if (picture_.isRound()) {
            const Arc& arc = picture_.arcs[i];
            json += ", \"ring\": " + std::to_string(arc.ring) + angle("from", arc.from) + angle("to", arc.to);
            if (arc.line != kNone) json += ", \"line\": " + std::to_string(arc.line);
        } else {
            json += field("x", box.x) + field("y", box.y) + field("width", static_cast<double>(box.width)) +
                    field("height", static_cast<double>(box.height));
        }
        if (box.kind == BoxKind::unknownParent) {
            json += ", \"sex\": " + jsonText(nameOf(box.sex));
            if (box.childOf != kNone) json += ", \"childOf\": " + std::to_string(box.childOf);
        }
        return json;
    }

    static std::string personFields(const Box& box) {
        std::string json = ", \"repeat\": " + std::to_string(box.repeat) +
                           ", \"hidden\": {\"parents\": " + std::to_string(box.hiddenParents) +
                           ", \"partners\": " + std::to_string(box.hiddenPartners) +
                           ", \"children\": " + std::to_string(box.hiddenChildren) + "}";
        if (box.furtherParents > 0) json += ", \"furtherParents\": " + std::to_string(box.furtherParents);
        if (box.hasFlag) json += std::string(", \"flag\": ") + (box.flag ? "true" : "false");
        return json;
    }

    std::string familyJson(const Family& family) const {
        std::string json = "{";
        if (family.number != 0) json += knownFamilyFields(family.number);
        json += "\"parents\": " + placesJson(picture_.parents(family)) +
                ", \"children\": " + placesJson(picture_.children(family)) + ", \"childKinds\": " +
                listOf(picture_.kinds(family), [](kin::ChildKind kind) { return jsonText(nameOf(kind)); }) +
                ", \"style\": " + jsonText(nameOf(family.style)) + ",\n   \"lines\": [";
        std::string_view separator = "\n    ";
        for (const Line& line : picture_.linesOf(family)) {
            json.append(separator).append(lineJson(line));
            separator = ",\n    ";
        }
        return json + "]}";
    }

    std::string knownFamilyFields(std::uint32_t familyNumber) const {
        std::string json = "\"number\": " + std::to_string(familyNumber) + ", ";
        const std::string xref = facts_.familyXref ? facts_.familyXref(familyNumber) : std::string();
        if (!xref.empty()) json += "\"xref\": " + jsonText(xref) + ", ";
        const std::string label = facts_.familyLabel ? facts_.familyLabel(familyNumber) : std::string();
        if (!label.empty()) json += "\"label\": " + jsonText(label) + ", ";
        return json;
    }

    std::string lineJson(const Line& line) const {
        return "{\"role\": " + jsonText(nameOf(line.role)) + field("x1", line.x1) + field("y1", line.y1) +
               field("x2", line.x2) + field("y2", line.y2) +
               ", \"child\": " + (line.child == kNone ? "null" : std::to_string(line.child)) +
               ", \"bridges\": " + listOf(picture_.bridgesOf(line), number) + "}";
    }

    std::string wayJson(const Way& way) const {
        return "{\"kind\": " + jsonText(nameOf(way.kind)) +
               ", \"boxes\": " + placesJson(picture_.boxesOf(way)) +
               ", \"ancestors\": " + placesJson(picture_.ancestorsOf(way)) +
               ", \"words\": " + jsonText(way.words) + ", \"lines\": " +
               listOf(picture_.piecesOf(way),
                      [](const WayPiece& piece) {
                          return listOf(std::array{piece.x1, piece.y1, piece.x2, piece.y2}, number);
                      }) +
               "}";
    }

    static std::string foldedJson(const FoldedBranch& folded) {
        return "{\"box\": " + std::to_string(folded.box) +
               ", \"branch\": " + jsonText(nameOf(folded.branch)) +
               ", \"side\": " + jsonText(nameOf(folded.side)) +
               ", \"count\": " + std::to_string(folded.count) + "}";
    }

    static std::string markJson(const Mark& mark) {
        std::string boxes;
        for (const Index box : mark.boxes) {
            if (box != kNone) boxes += (boxes.empty() ? "" : ", ") + std::to_string(box);
        }
        return "{\"kind\": " + jsonText(nameOf(mark.kind)) + ", \"boxes\": [" + boxes +
               "], \"number\": " + std::to_string(mark.number) + "}";
    }

    const Picture& picture_;
    const PictureFacts& facts_;
    const TextSink& sink_;
    std::string json_;  // what the sink has not yet
};

}  // namespace

void writePictureJson(const Picture& picture, const PictureFacts& facts, const TextSink& write) {
    PictureWriter(picture, facts, write).write();
}

std::string pictureJson(const Picture& picture, const PictureFacts& facts) {
    std::string json;
    writePictureJson(picture, facts, [&json](std::string_view piece) { json += piece; });
    return json;
}

}  // namespace olvane::picture
