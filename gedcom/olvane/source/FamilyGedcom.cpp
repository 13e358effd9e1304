// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/source/GedcomFamily.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>
#include <utility>
#include <vector>

namespace olvane::gedcom {
namespace {

using kin::ChildKind;
using kin::kNobody;
using kin::Place;
using kin::UnionPlace;
using kin::UnionState;

// A sorting date that nobody wrote otherwise, as 1901-05-03 or 1901-05, in GEDCOM's words; any other text as it is. Where
// nothing is written, the table gives the sorting date for it.
std::string dateOf(std::string_view written, std::string_view sorting) {
    constexpr std::string_view kMonths = "JANFEBMARAPRMAYJUNJULAUGSEPOCTNOVDEC";
    if (written != sorting || (sorting.size() != 7 && sorting.size() != 10) || sorting[4] != '-')
        return std::string(written);
    const std::size_t month = static_cast<std::size_t>(10 * (sorting[5] - '0') + sorting[6] - '0');
    if (month < 1 || month > 12) return std::string(sorting);
    std::string date(sorting.substr(std::min<std::size_t>(8, sorting.size())));
    if (date.starts_with('0')) date.erase(0, 1);
    if (!date.empty()) date += ' ';
    date += kMonths.substr(3 * (month - 1), 3);
    date += ' ';
    date += sorting.substr(0, 4);
    return date;
}

std::string pointer(const char* prefix, std::int64_t number) {
    return "@" + (prefix + std::to_string(number)) + "@";
}

// The parts of one name, by their kinds.
class NameGroup {
public:
    bool has(NameKind kind) const { return !at(kind).empty(); }
    std::string_view at(NameKind kind) const { return parts_[static_cast<std::size_t>(kind)]; }
    void set(NameKind kind, std::string_view text) { parts_[static_cast<std::size_t>(kind)] = text; }

    // With the surname between slashes.
    std::string value() const {
        const std::string_view surname = at(NameKind::surname);
        std::string name(at(NameKind::full));
        if (name.empty()) {
            for (const NameKind kind :
                 {NameKind::prefix, NameKind::given, NameKind::surname, NameKind::suffix})
                if (has(kind)) name.append(name.empty() ? "" : " ").append(at(kind));
        }
        const std::size_t place = surname.empty() ? std::string::npos : name.rfind(surname);
        if (place != std::string::npos) name.insert(place + surname.size(), 1, '/').insert(place, 1, '/');
        return name;
    }

private:
    std::array<std::string_view, 8> parts_{};
};

class Writer {
public:
    explicit Writer(const olvane::Family& table) : table_(table), graph_(kinGraphOf(table)) {}

    std::string text() && {
        nameUnions();
        text_ = "0 HEAD\n1 SOUR Olvane\n1 GEDC\n2 VERS 5.5.1\n2 FORM LINEAGE-LINKED\n1 CHAR UTF-8\n";
        for (Place place = 0; place < static_cast<Place>(graph_.personCount()); ++place) writePerson(place);
        for (UnionPlace u = 0; u < static_cast<UnionPlace>(graph_.unionCount()); ++u) writeUnion(u);
        text_ += "0 TRLR\n";
        return std::move(text_);
    }

private:
    // A union without a number in the table gets one that no family has.
    void nameUnions() {
        const auto numbers = table_.familyNumbers();
        std::int64_t next = 0;
        for (const auto number : numbers) next = std::max(next, std::int64_t{number});
        for (UnionPlace u = 0; u < static_cast<UnionPlace>(graph_.unionCount()); ++u) {
            const std::int64_t number = graph_.family(u);
            unions_.push_back(pointer("F", number != 0 ? number : ++next));
        }
    }

    const std::string& nameOf(UnionPlace u) const { return unions_[static_cast<std::size_t>(u)]; }

    // Further lines of the text are lines of their own; every @ in it is doubled.
    void line(char level, std::string_view tag, std::string_view text) {
        begin(level, tag);
        if (!text.empty()) text_ += ' ';
        for (const char c : text) {
            if (c == '\r') continue;
            if (c == '\n') {
                text_ += '\n';
                begin(static_cast<char>(level + 1), "CONT ");
            } else {
                text_.append(c == '@' ? 2 : 1, c);
            }
        }
        text_ += '\n';
    }
    void begin(char level, std::string_view tag) {
        text_ += level;
        text_ += ' ';
        text_ += tag;
    }
    void link(char level, std::string_view tag, std::string_view to) {
        begin(level, tag);
        text_ += ' ';
        text_ += to;
        text_ += '\n';
    }
    void piece(std::string_view tag, std::string_view text) {
        if (!text.empty()) line('2', tag, text);
    }

    void writePerson(Place place) {
        const std::int64_t id = graph_.id(place);
        const PersonRow row = table_.person(id);
        link('0', pointer("", id), "INDI");
        writeNames(id);
        if (row.sex != kin::Sex::unknown) line('1', "SEX", row.sex == kin::Sex::male ? "M" : "F");
        writeEvent("BIRT", dateOf(row.birthWritten, row.birth), table_.field(id, "birthPlace"), false);
        writeEvent("DEAT", dateOf(row.deathWritten, row.death), table_.field(id, "deathPlace"), row.dead);
        for (const LabelField& field : table_.fields(id)) writeField(field);
        for (const UnionPlace u : graph_.unionsAsChild(place)) writeParents(u, place);
        for (const UnionPlace u : marriagesOf(place)) link('1', "FAMS", nameOf(u));
    }

    void writeNames(std::int64_t id) {
        NameGroup group;
        for (const NamePart& part : table_.names(id)) {
            if (part.kind == NameKind::married || part.kind == NameKind::other) {
                writeName(std::exchange(group, NameGroup()));
                line('1', "NAME", part.text);
                piece("TYPE", part.kind == NameKind::married ? "married" : "");
                continue;
            }
            if (group.has(part.kind)) writeName(std::exchange(group, NameGroup()));
            group.set(part.kind, part.text);
        }
        writeName(group);
    }

    void writeName(const NameGroup& group) {
        const std::string value = group.value();
        if (value.empty() && !group.has(NameKind::nickname)) return;
        line('1', "NAME", value);
        piece("NPFX", group.at(NameKind::prefix));
        piece("GIVN", group.at(NameKind::given));
        piece("SURN", group.at(NameKind::surname));
        piece("NSFX", group.at(NameKind::suffix));
        piece("NICK", group.at(NameKind::nickname));
    }

    void writeEvent(std::string_view tag, std::string_view date, std::string_view place, bool happened) {
        if (date.empty() && place.empty() && !happened) return;
        line('1', tag, date.empty() && place.empty() ? "Y" : "");
        piece("DATE", date);
        piece("PLAC", place);
    }

    void writeField(const LabelField& field) {
        if (field.key == "xref" || field.key == "birthPlace" || field.key == "deathPlace") return;
        if (field.key == "occupation") return line('1', "OCCU", field.text);
        if (field.key == "note") return line('1', "NOTE", field.text);
        line('1', "FACT", field.text);
        piece("TYPE", field.key);
    }

    void writeParents(UnionPlace u, Place child) {
        constexpr std::array<const char*, 6> kWords = {"", "adopted", "foster", "step", "sealing", "other"};
        link('1', "FAMC", nameOf(u));
        const auto children = graph_.children(u);
        const auto at = std::find(children.begin(), children.end(), child) - children.begin();
        piece("PEDI",
              kWords.at(static_cast<std::size_t>(graph_.childKinds(u)[static_cast<std::size_t>(at)])));
    }

    std::vector<UnionPlace> marriagesOf(Place place) const {
        const auto unions = graph_.unionsAsPartner(place);
        std::vector<UnionPlace> order(unions.begin(), unions.end());
        const std::int64_t preferred = table_.preferredSpouse(graph_.id(place));
        std::stable_partition(order.begin(), order.end(), [&](UnionPlace u) {
            const Place other = graph_.otherPartner(u, place);
            return other != kNobody && graph_.id(other) == preferred;
        });
        return order;
    }

    void writeUnion(UnionPlace u) {
        link('0', nameOf(u), "FAM");
        const auto& partners = graph_.partners(u);
        if (partners[0] != kNobody) link('1', "HUSB", pointer("", graph_.id(partners[0])));
        if (partners[1] != kNobody) link('1', "WIFE", pointer("", graph_.id(partners[1])));
        for (const Place child : graph_.children(u)) link('1', "CHIL", pointer("", graph_.id(child)));
        if (graph_.family(u) != 0) writeMarriage(table_.family(graph_.family(u)));
    }

    void writeMarriage(const FamilyRow& row) {
        const bool isDivorced = row.state == UnionState::divorced;
        writeEvent("MARR", dateOf(row.marriageWritten, row.marriage), row.marriagePlace,
                   isDivorced || row.state == UnionState::married);
        if (isDivorced) line('1', "DIV", "Y");
        if (row.state == UnionState::unmarried) line('1', "NO", "MARR");
    }

    const olvane::Family& table_;
    kin::KinGraph graph_;
    std::vector<std::string> unions_;
    std::string text_;
};

}  // namespace

std::string gedcomTextOf(const olvane::Family& table) {
    return Writer(table).text();
}

}  // namespace olvane::gedcom
