// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/picture/PictureJsonReader.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <string>
#include <utility>

#include <nlohmann/json.hpp>

#include <olvane/picture/PictureNames.h>
#include <olvane/picture/shared/Circle.h>

namespace olvane::picture {

namespace {

using Json = nlohmann::json;

constexpr double kFarthest = 1e12;  // points
constexpr int kDeepest = 64;

[[noreturn]] void fail(const std::string& reason) {
    throw PictureJsonError("not a picture of format 2: " + reason);
}

// Lists and objects nested deeper than a picture needs are refused before anything recurses into them.
bool isTooDeep(std::string_view json) {
    int depth = 0;
    bool inText = false;
    for (std::size_t i = 0; i < json.size(); ++i) {
        const char c = json[i];
        if (inText) {
            if (c == '\\') ++i;
            inText = c != '"';
        } else if (c == '"') {
            inText = true;
        } else if (c == '[' || c == '{') {
            if (++depth > kDeepest) return true;
        } else if (c == ']' || c == '}') {
            --depth;
        }
    }
    return false;
}

const Json* find(const Json& object, const char* name) {
    if (!object.is_object()) fail("an object is expected where " + std::string(name) + " stands");
    const auto found = object.find(name);
    return found == object.end() || found->is_null() ? nullptr : &*found;
}

const Json& listAt(const Json& object, const char* name) {
    static const Json empty = Json::array();
    const Json* list = find(object, name);
    if (list == nullptr) return empty;
    if (!list->is_array()) fail(std::string(name) + " is no list");
    return *list;
}

double numberOf(const Json& value, const char* name) {
    if (!value.is_number()) fail(std::string(name) + " is no number");
    const auto number = value.get<double>();
    if (!(std::abs(number) <= kFarthest)) fail(std::string(name) + " is out of range");
    return number;
}

double numberAt(const Json& object, const char* name) {
    const Json* value = find(object, name);
    return value == nullptr ? 0 : numberOf(*value, name);
}

std::int64_t integerOf(const Json& value, const char* name) {
    if (!value.is_number_integer()) fail(std::string(name) + " is no whole number");
    if (value.is_number_unsigned() &&
        value.get<std::uint64_t>() > static_cast<std::uint64_t>(std::numeric_limits<std::int64_t>::max())) {
        fail(std::string(name) + " is out of range");
    }
    return value.get<std::int64_t>();
}

template <class Integer>
Integer integerAt(const Json& object, const char* name) {
    const Json* value = find(object, name);
    if (value == nullptr) return 0;
    const std::int64_t integer = integerOf(*value, name);
    if (!std::in_range<Integer>(integer)) fail(std::string(name) + " is out of range");
    return static_cast<Integer>(integer);
}

// The value of that name, among the first `count`; the fallback where it is absent or not known.
template <class Value>
Value namedValue(const Json* json, int count, Value fallback) {
    if (json == nullptr || !json->is_string()) return fallback;
    const auto& name = json->get_ref<const std::string&>();
    for (int i = 0; i < count; ++i) {
        if (nameOf(static_cast<Value>(i)) == name) return static_cast<Value>(i);
    }
    return fallback;
}

class PictureReader {
public:
    Picture read(const Json& json) {
        if (!json.is_object()) fail("the text is no object");
        if (integerAt<std::int64_t>(json, "format") != 2) fail("its format is not 2");
        if (const Json* view = find(json, "view"); view != nullptr && view->is_string()) {
            picture_.view = view->get<std::string>();
        }
        const Json& boxes = listAt(json, "boxes");
        if (boxes.size() > static_cast<std::size_t>(std::numeric_limits<Index>::max()))
            fail("too many boxes");
        boxCount_ = static_cast<Index>(boxes.size());
        for (const Json& box : boxes) readBox(box);
        if (!picture_.arcs.empty() && picture_.arcs.size() != boxes.size()) {
            fail("only some of the boxes have a ring");
        }
        readRings(json);
        findFocus(integerAt<std::int64_t>(json, "focus"));
        for (const Json& family : listAt(json, "families")) readFamily(family);
        for (const Json& mark : listAt(json, "marks")) readMark(mark);
        for (const Json& folded : listAt(json, "folded")) readFolded(folded);
        readOther(json);
        for (const Json& way : listAt(json, "ways")) readWay(way);
        return std::move(picture_);
    }

private:
    Index placeOf(const Json& value, const char* name) const {
        const std::int64_t place = integerOf(value, name);
        if (place < 0 || place >= boxCount_) fail(std::string(name) + " names a box that is not there");
        return static_cast<Index>(place);
    }
    Index placeAt(const Json& object, const char* name) const {
        const Json* value = find(object, name);
        return value == nullptr ? kNone : placeOf(*value, name);
    }

    void readWay(const Json& json) {
        Way way;
        way.kind = namedValue(find(json, "kind"), 3, WayKind::blood);
        way.firstBox = static_cast<std::uint32_t>(picture_.wayBoxes.size());
        for (const Json& box : listAt(json, "boxes")) picture_.wayBoxes.push_back(placeOf(box, "a way"));
        way.boxCount = static_cast<std::uint32_t>(picture_.wayBoxes.size()) - way.firstBox;
        for (const Json& box : listAt(json, "ancestors")) {
            picture_.wayBoxes.push_back(placeOf(box, "a way"));
            ++way.ancestorCount;
        }
        way.words = textAt(json, "words");
        way.firstPiece = static_cast<std::uint32_t>(picture_.wayPieces.size());
        for (const Json& piece : listAt(json, "lines")) readWayPiece(piece);
        way.pieceCount = static_cast<std::uint32_t>(picture_.wayPieces.size()) - way.firstPiece;
        picture_.ways.push_back(std::move(way));
    }

    void readWayPiece(const Json& json) {
        if (!json.is_array() || json.size() != 4) fail("a line of a way has four numbers");
        picture_.wayPieces.push_back({numberOf(json[0], "lines"), numberOf(json[1], "lines"),
                                      numberOf(json[2], "lines"), numberOf(json[3], "lines")});
    }

    static std::string textAt(const Json& object, const char* name) {
        const Json* text = find(object, name);
        return text != nullptr && text->is_string() ? text->get<std::string>() : std::string();
    }

    void readOther(const Json& json) {
        if (find(json, "other") == nullptr) return;
        const auto id = integerAt<std::int64_t>(json, "other");
        for (std::size_t i = 0; i < picture_.boxes.size() && picture_.other == kNone; ++i) {
            if (picture_.boxes[i].id == id) picture_.other = static_cast<Index>(i);
        }
        picture_.focusIs = textAt(json, "focusIs");
        picture_.otherIs = textAt(json, "otherIs");
    }

    void readRings(const Json& json) {
        if (find(json, "rings") == nullptr) return;
        for (const Json& radius : listAt(json, "rings")) {
            picture_.ringRadii.push_back(numberOf(radius, "rings"));
        }
        picture_.middleX = numberAt(json, "middleX");
        picture_.middleY = numberAt(json, "middleY");
        for (std::size_t i = 0; i < picture_.arcs.size(); ++i) setPlace(picture_.boxes[i], picture_.arcs[i]);
    }

    // A box of a round chart says where it stands by its ring alone.
    void setPlace(Box& box, const Arc& arc) const {
        if (arc.ring < 0 || static_cast<std::size_t>(arc.ring) + 1 >= picture_.ringRadii.size()) return;
        const auto ring = static_cast<std::size_t>(arc.ring);
        const CircleBounds bounds =
            boundsOnCircle(arc.from, arc.to, picture_.ringRadii[ring], picture_.ringRadii[ring + 1]);
        box.x = picture_.middleX + bounds.left;
        box.y = picture_.middleY + bounds.top;
        box.width = static_cast<float>(bounds.right - bounds.left);
        box.height = static_cast<float>(bounds.bottom - bounds.top);
    }

    void readBox(const Json& json) {
        Box box;
        box.id = integerAt<std::int64_t>(json, "id");
        box.kind = namedValue(find(json, "kind"), 2, BoxKind::person);
        box.x = numberAt(json, "x");
        box.y = numberAt(json, "y");
        box.width = static_cast<float>(numberAt(json, "width"));
        box.height = static_cast<float>(numberAt(json, "height"));
        box.childOf = placeAt(json, "childOf");
        box.repeat = integerAt<std::int32_t>(json, "repeat");
        box.sex = namedValue(find(json, "sex"), 3, kin::Sex::unknown);
        if (const Json* person = find(json, "person"); person != nullptr && person->is_object()) {
            box.sex = namedValue(find(*person, "sex"), 3, box.sex);
        }
        readHidden(json, box);
        if (find(json, "ring") != nullptr) {
            picture_.arcs.push_back({integerAt<std::int32_t>(json, "ring"), numberAt(json, "from"),
                                     numberAt(json, "to"), placeAt(json, "line")});
        }
        picture_.boxes.push_back(box);
    }

    static void readHidden(const Json& json, Box& box) {
        if (const Json* hidden = find(json, "hidden"); hidden != nullptr) {
            box.hiddenParents = integerAt<std::int32_t>(*hidden, "parents");
            box.hiddenPartners = integerAt<std::int32_t>(*hidden, "partners");
            box.hiddenChildren = integerAt<std::int32_t>(*hidden, "children");
        }
        box.furtherParents = integerAt<std::int32_t>(json, "furtherParents");
        const Json* flag = find(json, "flag");
        box.hasFlag = flag != nullptr;
        box.flag = flag != nullptr && flag->is_boolean() && flag->get<bool>();
    }

    // The person's first box, or its only one.
    void findFocus(std::int64_t id) {
        for (Index i = 0; id != 0 && i < boxCount_; ++i) {
            const Box& box = picture_.boxes[static_cast<std::size_t>(i)];
            if (box.id == id && box.repeat <= 1) {
                picture_.focus = i;
                return;
            }
        }
    }

    void readFamily(const Json& json) {
        Family family;
        family.firstMember = static_cast<std::uint32_t>(picture_.members.size());
        family.firstLine = static_cast<std::uint32_t>(picture_.lines.size());
        family.number = integerAt<std::uint32_t>(json, "number");
        family.style = namedValue(find(json, "style"), 4, kin::UnionState::unknown);
        const Json& parents = listAt(json, "parents");
        const Json& children = listAt(json, "children");
        if (parents.size() > 2) fail("a family has more than two parents");
        family.parentCount = static_cast<std::uint8_t>(parents.size());
        family.childCount = static_cast<std::uint32_t>(children.size());
        for (const Json& parent : parents) picture_.members.push_back(placeOf(parent, "parents"));
        for (const Json& child : children) picture_.members.push_back(placeOf(child, "children"));
        picture_.childKinds.resize(picture_.members.size(), kin::ChildKind::birth);
        readKinds(listAt(json, "childKinds"), family);
        for (const Json& line : listAt(json, "lines")) readLine(line);
        family.lineCount = static_cast<std::uint32_t>(picture_.lines.size()) - family.firstLine;
        picture_.families.push_back(family);
    }

    void readKinds(const Json& kinds, const Family& family) {
        for (std::size_t i = 0; i < kinds.size() && i < family.childCount; ++i) {
            picture_.childKinds[family.firstMember + family.parentCount + i] =
                namedValue(&kinds[i], 6, kin::ChildKind::unknown);
        }
    }

    void readLine(const Json& json) {
        Line line;
        line.role = namedValue(find(json, "role"), 5, LineRole::link);
        line.x1 = numberAt(json, "x1");
        line.y1 = numberAt(json, "y1");
        line.x2 = numberAt(json, "x2");
        line.y2 = numberAt(json, "y2");
        line.child = placeAt(json, "child");
        line.firstBridge = static_cast<std::uint32_t>(picture_.bridges.size());
        const Json& bridges = listAt(json, "bridges");
        if (bridges.size() > std::numeric_limits<std::uint16_t>::max()) fail("a line has too many bridges");
        for (const Json& place : bridges) {
            picture_.bridges.push_back(numberOf(place, "bridges"));
        }
        line.bridgeCount = static_cast<std::uint16_t>(bridges.size());
        picture_.lines.push_back(line);
    }

    void readMark(const Json& json) {
        Mark mark;
        mark.kind = namedValue(find(json, "kind"), 3, MarkKind::samePerson);
        mark.number = integerAt<std::int32_t>(json, "number");
        const Json& boxes = listAt(json, "boxes");
        if (boxes.empty() || boxes.size() > 3) fail("a mark has one to three boxes");
        for (std::size_t i = 0; i < boxes.size(); ++i) mark.boxes[i] = placeOf(boxes[i], "boxes");
        picture_.marks.push_back(mark);
    }

    void readFolded(const Json& json) {
        FoldedBranch folded;
        folded.box = placeAt(json, "box");
        if (folded.box == kNone) fail("a folded branch has no box");
        folded.count = integerAt<std::int32_t>(json, "count");
        folded.branch = namedValue(find(json, "branch"), 3, Branch::down);
        folded.side = namedValue(find(json, "side"), 4, Side::bottom);
        picture_.folded.push_back(folded);
    }

    Picture picture_;
    Index boxCount_ = 0;
};

}  // namespace

Picture readPictureJson(std::string_view json) {
    if (isTooDeep(json)) fail("it is nested too deeply");
    // Names are of no use here, and may be long.
    const auto isRead = [](int, Json::parse_event_t event, const Json& value) {
        return event != Json::parse_event_t::key ||
               (value != "name" && value != "given" && value != "surname");
    };
    const Json parsed = Json::parse(json, isRead, false);
    if (parsed.is_discarded()) fail("it is not JSON");
    return PictureReader().read(parsed);
}

}  // namespace olvane::picture
