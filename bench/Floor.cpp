// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A layout's questions, recorded by a data source that passes them on, and asked again without a layout.

#include "Floor.h"

#include <charconv>
#include <stdexcept>
#include <utility>

namespace bench {

namespace {

using Kind = HostQuestion::Kind;

// Passes every question on and keeps it.
class RecordingSource : public OlvaneViewerManagerWrapProtocol {
public:
    RecordingSource(std::shared_ptr<OlvaneViewerManagerWrapProtocol> source,
                    std::vector<HostQuestion>& questions)
        : source_(std::move(source)), questions_(questions) {}

    std::int64_t fatherForPersonWithID(std::int64_t personId) override {
        keep(Kind::father, personId);
        return source_->fatherForPersonWithID(personId);
    }
    std::int64_t motherForPersonWithID(std::int64_t personId) override {
        keep(Kind::mother, personId);
        return source_->motherForPersonWithID(personId);
    }
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId) override {
        keep(Kind::spouses, personId);
        return source_->spousesForPersonWithID(personId);
    }
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId) override {
        keep(Kind::children, personId);
        return source_->childrenForPersonWithID(personId);
    }
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) override {
        keep(Kind::preferred, personId, spouseId);
        return source_->isPreferredSpouse(personId, spouseId);
    }
    bool isPersonDead(std::int64_t personId) override {
        keep(Kind::dead, personId);
        return source_->isPersonDead(personId);
    }
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth) override {
        questions_.push_back({Kind::date, isBirth, personId, 0});
        return source_->dateForPersonWithID(personId, isBirth);
    }
    std::int32_t sexOfPersonWithID(std::int64_t personId) override {
        keep(Kind::sex, personId);
        return source_->sexOfPersonWithID(personId);
    }

private:
    void keep(Kind kind, std::int64_t personId, std::int64_t spouseId = 0) {
        questions_.push_back({kind, false, personId, spouseId});
    }

    std::shared_ptr<OlvaneViewerManagerWrapProtocol> source_;
    std::vector<HostQuestion>& questions_;
};

std::int64_t sumOf(const std::vector<std::int64_t>& ids) {
    std::int64_t sum = 0;
    for (const std::int64_t id : ids) sum += id;
    return sum;
}

std::int64_t parentOrNothing(std::int64_t answer) {
    return answer == OlvaneViewerManagerWrapProtocol::kPersonNotFound ? 0 : answer;
}

std::int64_t answerTo(OlvaneViewerManagerWrapProtocol& source, const HostQuestion& question) {
    const std::int64_t id = question.personId;
    switch (question.kind) {
        case Kind::father:
            return parentOrNothing(source.fatherForPersonWithID(id));
        case Kind::mother:
            return parentOrNothing(source.motherForPersonWithID(id));
        case Kind::spouses:
            return sumOf(source.spousesForPersonWithID(id));
        case Kind::children:
            return sumOf(source.childrenForPersonWithID(id));
        case Kind::preferred:
            return source.isPreferredSpouse(id, question.spouseId) ? 1 : 0;
        case Kind::dead:
            return source.isPersonDead(id) ? 1 : 0;
        case Kind::date:
            return static_cast<std::int64_t>(source.dateForPersonWithID(id, question.isBirth).size());
        case Kind::sex:
            return source.sexOfPersonWithID(id);
    }
    throw std::logic_error("no such question");
}

template <class Number>
void appendNumber(std::string& text, Number value, char separator) {
    char digits[24];
    char* const end = std::to_chars(digits, digits + sizeof digits - 1, value).ptr;
    *end = separator;
    text.append(digits, static_cast<std::size_t>(end - digits) + 1);
}

void appendRecord(std::string& text, const olvane::LayoutRecord& record) {
    appendNumber(text, record.id, ':');
    appendNumber(text, record.x, ':');
    appendNumber(text, record.y, ':');
    appendNumber(text, record.hasHiddenRelatives ? 1 : 0, ':');
    for (const olvane::LayoutSegment& segment : record.segments) {
        appendNumber(text, segment.x1, ',');
        appendNumber(text, segment.y1, ',');
        appendNumber(text, segment.x2, ',');
        appendNumber(text, segment.y2, '|');
    }
    if (record.addNode) {
        text += record.addNode->male ? ":M:" : ":F:";
        appendNumber(text, record.addNode->childId, ';');
    } else {
        text += ';';
    }
}

}  // namespace

Floor::Floor(const MadeLayout& layout) : source_(layout.source()) {
    const std::string whole = layout.textFrom(std::make_shared<RecordingSource>(source_, questions_));
    records_ = olvane::readLayoutText(whole);
    if (text() != whole) throw std::logic_error("the floor wrote another text than the layout");
}

std::string Floor::text() const {
    answers_ = 0;
    for (const HostQuestion& question : questions_) answers_ += answerTo(*source_, question);
    std::string written;
    for (const olvane::LayoutRecord& record : records_) appendRecord(written, record);
    return written;
}

}  // namespace bench
