// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The result text: one record for each person, in the order of the walk.
//
//     PERSON:X:Y:FLAG:SEGMENTS;                 a real person
//     PERSON:X:Y:FLAG:SEGMENTS:SEX:CHILD;       an unknown parent; SEX is M or F, CHILD the person that it stands
//     above
//
// SEGMENTS is X1,Y1,X2,Y2| for each segment, with nothing between them. All numbers are whole, cut toward
// zero.

#include <olvane/boundary/LayoutPieces.h>

#include <olvane/boundary/DecimalInternal.h>
#include <olvane/boundary/ResultRecordInternal.h>
#include <olvane/graph/WholePointInternal.h>

#include <cstddef>
#include <cstring>
#include <span>
#include <string_view>

namespace olvane {

namespace {

// 0 means unset, also when a bound has come to stand there.
void updateBounds(ResultBounds& bounds, int x, int y) {
    if (bounds.minX > x || bounds.minX == 0) bounds.minX = x;
    if (bounds.minY > y || bounds.minY == 0) bounds.minY = y;
    if (bounds.maxX < x || bounds.maxX == 0) bounds.maxX = x;
    if (bounds.maxY < y || bounds.maxY == 0) bounds.maxY = y;
}

char* write(char* place, int value, char separator) {
    char* const end = writeDecimal(place, value);
    *end = separator;
    return end + 1;
}

constexpr std::size_t kCopied = 16;  // no number with its separator is longer

// The number from first to last once more, at place, with its separator. Reads and writes kCopied bytes, however
// long it is: a copy of a fixed length is two instructions.
char* repeat(const char* first, const char* last, char* place) {
    char number[kCopied];
    std::memcpy(number, first, kCopied);
    std::memcpy(place, number, kCopied);
    return place + (last - first);
}

// Text put together here and appended in few pieces.
class Piece {
public:
    explicit Piece(std::string& text) : text_(text) {}

    void addPersonPlaceAndFlag(std::string_view person, int x, int y, bool flag) {
        if (person.size() > kLongestDecimal) {
            text_ += person;
        } else {
            end_ += person.copy(end_, kLongestDecimal);
        }
        *end_++ = ':';
        end_ = write(end_, x, ':');
        end_ = write(end_, y, ':');
        end_ = write(end_, flag ? 1 : 0, ':');
    }

    // Lines run along the axes, so the second end mostly shares a number with the first.
    template <class Segment>
    void add(const Segment& segment) {
        makeRoom();
        char* const x1 = end_;
        char* const y1 = write(x1, whole(segment.x1), ',');
        char* const x2 = write(y1, whole(segment.y1), ',');
        char* const y2 = segment.x2 == segment.x1 ? repeat(x1, y1, x2) : write(x2, whole(segment.x2), ',');
        end_ = segment.y2 == segment.y1 ? repeat(y1, x2, y2) : write(y2, whole(segment.y2), ',');
        end_[-1] = '|';
        length_ = static_cast<std::size_t>(end_ - x1);
    }
    // The segment that was added last, once more.
    void repeatSegment() {
        makeRoom();
        std::memcpy(end_, end_ - length_, length_);
        end_ += length_;
    }

    void flush() {
        text_.append(room_, static_cast<std::size_t>(end_ - room_));
        end_ = room_;
    }

private:
    static int whole(float value) { return wholePoint(value); }
    static int whole(int value) { return value; }

    // With what a repeated number writes past its end.
    static constexpr std::size_t kLongestSegment = 4 * (kLongestDecimal + 1) + kCopied;

    // The last segment stays where it can be copied from.
    void makeRoom() {
        if (end_ <= room_ + sizeof room_ - kLongestSegment) return;
        end_ -= length_;
        const char* const last = end_;
        flush();
        std::memmove(room_, last, length_);
        end_ += length_;
    }

    std::string& text_;
    char room_[10 * kLongestSegment];
    char* end_ = room_;
    std::size_t length_ = 0;  // of the last segment
};

// Each child of a couple leaves the same drop, one behind the other, so the last piece often serves again.
template <class Segments>
void addSegments(Piece& piece, const Segments& segments) {
    auto last = segments.end();
    for (auto segment = segments.begin(); segment != segments.end(); last = segment++) {
        const bool isRepeated = last != segments.end() && last->x1 == segment->x1 &&
                                last->y1 == segment->y1 && last->x2 == segment->x2 && last->y2 == segment->y2;
        if (isRepeated) {
            piece.repeatSegment();
        } else {
            piece.add(*segment);
        }
    }
}

void appendSexAndChild(std::string& text, const ViewerGlue& glue, int key) {
    text += ':';
    text += glue.addNodeIsMale(key) ? 'M' : 'F';
    text += ':';
    text += glue.childTextOfAddNode(key);
}

void writeRecord(const ViewerGlue& glue, ResultBounds& bounds, std::string& text, TreeViewPerson& person) {
    ViewerGlue::DecimalBuffer buffer;
    const std::string_view personText = glue.textOfKey(person.personId, buffer);
    const int x = wholePoint(person.getNodeCenter().x);
    const int y = wholePoint(person.getNodeCenter().y);
    updateBounds(bounds, x, y);
    Piece piece(text);
    piece.addPersonPlaceAndFlag(personText, x, y, person.hasNonDisplayedRelationships);
    addSegments(piece, person.lineSegments);
    piece.flush();
    if (glue.numberOfKey(person.personId) < 0) appendSexAndChild(text, glue, person.personId);
    text += ';';
}

}  // namespace

void appendRecord(const ViewerGlue& glue, int key, const TypedLayout::Box& box,
                  std::span<const TypedLayout::Line> lines, std::string& text) {
    ViewerGlue::DecimalBuffer buffer;
    Piece piece(text);
    piece.addPersonPlaceAndFlag(glue.textOfKey(key, buffer), box.x, box.y, box.hasHiddenRelatives);
    addSegments(piece, lines);
    piece.flush();
    if (box.id < 0) appendSexAndChild(text, glue, key);
    text += ';';
}

TreeViewPerson::Visitor resultWriter(ViewerGlue& glue, ResultBounds& bounds, std::string& text) {
    return [&glue, &bounds, &text](TreeViewPerson& person) { writeRecord(glue, bounds, text, person); };
}

}  // namespace olvane
