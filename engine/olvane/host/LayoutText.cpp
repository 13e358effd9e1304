// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reads the one line of text that a layout is handed out as, back to records:
//
//     17:0:-110:0:40,-15,40,0|40,0,82,0|;-1:-40:-220:0::M:17;
//
// A record is id, x, y and flag, each closed by ":", then segments, each closed by "|", then for a negative
// id ":", the sex, ":" and the child, and last ";". There is one reader, which stops at the first byte that
// does not fit; the strict form turns that into an exception, the lenient one hands out what came before.

#include <olvane/host/LayoutText.h>

#include <charconv>
#include <limits>
#include <utility>

namespace olvane {

namespace {

// Walks over the text; every read either consumes what it names or throws with the place where it failed.
class Cursor {
public:
    explicit Cursor(std::string_view text) : text_(text) {}

    bool atEnd() const { return position_ == text_.size(); }
    std::size_t position() const { return position_; }

    bool lookingAt(char wanted) const { return !atEnd() && text_[position_] == wanted; }

    void expect(char wanted) {
        if (!lookingAt(wanted)) fail(std::string("expected '") + wanted + "'");
        ++position_;
    }

    // Plain decimal as the writer gives it: no sign but "-", no leading zeros.
    template <class Number>
    Number readNumber(const char* what) {
        const std::string_view digits = digitsAhead();
        Number value = 0;
        const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), value);
        if (error == std::errc::result_out_of_range) fail(std::string(what) + " is out of range");
        if (error != std::errc() || end != digits.data() + digits.size() || !isPlain(digits)) {
            fail(std::string("expected ") + what);
        }
        position_ += digits.size();
        return value;
    }

    bool readChoice(char yes, char no, const char* what) {
        if (!lookingAt(yes) && !lookingAt(no)) fail(std::string("expected ") + what);
        return text_[position_++] == yes;
    }

private:
    std::string_view digitsAhead() const {
        std::size_t end = position_;
        if (end < text_.size() && text_[end] == '-') ++end;
        while (end < text_.size() && text_[end] >= '0' && text_[end] <= '9') ++end;
        return text_.substr(position_, end - position_);
    }

    static bool isPlain(std::string_view digits) {
        if (digits == "0") return true;
        if (digits.starts_with('-')) digits.remove_prefix(1);
        return !digits.empty() && digits.front() != '0';
    }

    [[noreturn]] void fail(const std::string& reason) const {
        throw LayoutTextError(position_, atEnd() ? reason + ", found the end" : reason);
    }

    std::string_view text_;
    std::size_t position_ = 0;
};

LayoutSegment readSegment(Cursor& cursor) {
    LayoutSegment segment;
    segment.x1 = cursor.readNumber<int>("x1");
    cursor.expect(',');
    segment.y1 = cursor.readNumber<int>("y1");
    cursor.expect(',');
    segment.x2 = cursor.readNumber<int>("x2");
    cursor.expect(',');
    segment.y2 = cursor.readNumber<int>("y2");
    cursor.expect('|');
    return segment;
}

AddNodeSuffix readAddNode(Cursor& cursor) {
    AddNodeSuffix suffix;
    cursor.expect(':');
    suffix.male = cursor.readChoice('M', 'F', "sex M or F");
    cursor.expect(':');
    suffix.childId = cursor.readNumber<std::int64_t>("the child's id");
    return suffix;
}

LayoutRecord readRecord(Cursor& cursor) {
    LayoutRecord record;
    record.id = cursor.readNumber<std::int64_t>("a person's id");
    cursor.expect(':');
    record.x = cursor.readNumber<int>("x");
    cursor.expect(':');
    record.y = cursor.readNumber<int>("y");
    cursor.expect(':');
    record.hasHiddenRelatives = cursor.readChoice('1', '0', "flag 0 or 1");
    cursor.expect(':');
    while (!cursor.atEnd() && !cursor.lookingAt(':') && !cursor.lookingAt(';')) {
        record.segments.push_back(readSegment(cursor));
    }
    if (record.id < 0) record.addNode = readAddNode(cursor);
    cursor.expect(';');
    return record;
}

void appendNumber(std::string& text, std::int64_t value) {
    char digits[std::numeric_limits<std::int64_t>::digits10 + 3];
    const auto end = std::to_chars(digits, digits + sizeof digits, value).ptr;
    text.append(digits, end);
}

void appendSegment(std::string& text, const LayoutSegment& segment) {
    appendNumber(text, segment.x1);
    text += ',';
    appendNumber(text, segment.y1);
    text += ',';
    appendNumber(text, segment.x2);
    text += ',';
    appendNumber(text, segment.y2);
    text += '|';
}

void appendRecord(std::string& text, const LayoutRecord& record) {
    appendNumber(text, record.id);
    text += ':';
    appendNumber(text, record.x);
    text += ':';
    appendNumber(text, record.y);
    text += record.hasHiddenRelatives ? ":1:" : ":0:";
    for (const LayoutSegment& segment : record.segments) appendSegment(text, segment);
    if (record.addNode) {
        text += record.addNode->male ? ":M:" : ":F:";
        appendNumber(text, record.addNode->childId);
    }
    text += ';';
}

}  // namespace

LayoutTextError::LayoutTextError(std::size_t position, const std::string& reason)
    : std::runtime_error("byte " + std::to_string(position) + ": " + reason),
      position_(position),
      reason_(reason) {}

LayoutReading readWholeRecords(std::string_view text) {
    LayoutReading reading;
    Cursor cursor(text);
    try {
        while (!cursor.atEnd()) {
            reading.records.push_back(readRecord(cursor));
            reading.wholeBytes = cursor.position();
        }
    } catch (const LayoutTextError& error) {
        reading.cut = error;
    }
    return reading;
}

std::vector<LayoutRecord> readLayoutText(std::string_view text) {
    LayoutReading reading = readWholeRecords(text);
    if (reading.cut) throw LayoutTextError(*reading.cut);
    return std::move(reading.records);
}

std::string writeLayoutText(const std::vector<LayoutRecord>& records) {
    std::string text;
    for (const LayoutRecord& record : records) appendRecord(text, record);
    return text;
}

}  // namespace olvane
