// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reading, writing and playing case files: a family, a layout request and the calls that fail, one
// directive a line. Nothing here knows how a layout is made, so that every program that makes one can be
// fed from the same file and be compared with the others.

#include <support/CaseFile.h>

#include <charconv>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <limits>
#include <sstream>
#include <utility>

namespace support {

namespace {

constexpr std::array<std::string_view, kHostOperationCount> kOperationNames = {
    "fatherForPersonWithID", "motherForPersonWithID", "spousesForPersonWithID", "childrenForPersonWithID",
    "isPreferredSpouse",     "isPersonDead",          "dateForPersonWithID",    "sexOfPersonWithID"};

// One line of a case, taken field by field. Every failure names the file and the line.
class DirectiveLine {
public:
    DirectiveLine(std::string_view line, std::string place) : rest(line), where(std::move(place)) {}

    [[noreturn]] void fail(const std::string& reason) const { throw std::runtime_error(where + reason); }

    bool atEnd() const { return ended; }

    // The text up to the next space; the last field ends the line.
    std::string_view field() {
        if (ended) fail("missing field");
        const std::size_t space = rest.find(' ');
        const std::string_view taken = rest.substr(0, space);
        ended = space == std::string_view::npos;
        rest = ended ? std::string_view() : rest.substr(space + 1);
        return taken;
    }

    // All that is left, spaces included; empty when nothing is left.
    std::string_view restOfLine() {
        ended = true;
        return std::exchange(rest, std::string_view());
    }

    template <typename Number>
    Number number() {
        const std::string_view text = field();
        Number value{};
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
        if (error != std::errc() || end != text.data() + text.size()) failNumber(text);
        return value;
    }

    // By the C library, since not every C++ library that this is compiled with reads doubles. Hexadecimal is none.
    double fraction() {
        const std::string text(field());
        char* end = nullptr;
        const double value = std::strtod(text.c_str(), &end);
        const bool isWhole = end == text.c_str() + text.size();
        if (text.empty() || !isWhole || text.front() == '+' ||
            text.find_first_of("xX") != std::string::npos) {
            failNumber(text);
        }
        return value;
    }

    PersonId person() { return number<PersonId>(); }

    bool truth() {
        const std::string_view text = field();
        if (text != "0" && text != "1") failNumber(text);
        return text == "1";
    }

    // Read as a double and narrowed; what a float cannot hold becomes an infinity.
    float size() {
        const double value = fraction();
        constexpr double kGreatest = std::numeric_limits<float>::max();
        if (std::abs(value) <= kGreatest || std::isnan(value)) return static_cast<float>(value);
        return std::copysign(std::numeric_limits<float>::infinity(), static_cast<float>(value > 0 ? 1 : -1));
    }

    std::vector<PersonId> persons() {
        std::vector<PersonId> list;
        while (!ended) list.push_back(person());
        return list;
    }

    void expectEnd() const {
        if (!ended) fail("surplus field '" + std::string(rest) + "'");
    }

private:
    [[noreturn]] void failNumber(std::string_view text) const {
        fail("bad number '" + std::string(text) + "'");
    }

    std::string_view rest;
    std::string where;
    bool ended = false;
};

using ReadDirective = void (*)(DirectiveLine&, CaseFile&);

void readFocus(DirectiveLine& line, CaseFile& result) {
    result.focus = line.person();
}

void readView(DirectiveLine& line, CaseFile& result) {
    const std::string_view name = line.field();
    if (name == "family") {
        const CaseFile defaults;
        result.view = defaults.view;
        result.maxGenerations = defaults.maxGenerations;
        result.maxStackDepth = defaults.maxStackDepth;
    } else if (name == "pedigree") {
        result.view = CaseView::pedigree;
        result.maxGenerations = line.number<std::int32_t>();
        result.maxStackDepth = line.number<std::int32_t>();
    } else {
        line.fail("unknown view '" + std::string(name) + "'");
    }
}

void readAdapter(DirectiveLine& line, CaseFile& result) {
    const std::string_view name = line.field();
    if (name != "host" && name != "bare") line.fail("unknown adapter '" + std::string(name) + "'");
    result.adapter = name == "bare" ? CaseAdapter::bare : CaseAdapter::host;
}

// The key may hold spaces of its own, so the value is what follows the last one.
void readOption(DirectiveLine& line, CaseFile& result) {
    const std::string_view text = line.restOfLine();
    const std::size_t space = text.rfind(' ');
    if (space == std::string_view::npos || space == 0) line.fail("missing field");
    const std::string_view value = text.substr(space + 1);
    if (value != "0" && value != "1") line.fail("bad number '" + std::string(value) + "'");
    result.options[std::string(text.substr(0, space))] = value == "1";
}

void readSize(DirectiveLine& line, CaseFile& result) {
    result.size.nodeWidth = line.size();
    result.size.nodeHeight = line.size();
    result.size.horzPadding = line.size();
    result.size.vertPadding = line.size();
    result.size.spouseLineStep = line.size();
    result.size.lineInset = line.size();
}

void readSex(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.sexes[id] = line.number<std::int32_t>();
}

void readDead(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.dead[id] = line.truth();
}

void readBirth(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.births[id] = line.restOfLine();
}

void readDate(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.dates[id] = line.restOfLine();
}

void readFather(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.fathers[id] = line.person();
}

void readMother(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.mothers[id] = line.person();
}

void readSpouses(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.spouses[id] = line.persons();
}

void readChildren(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.children[id] = line.persons();
}

void readPreferred(DirectiveLine& line, CaseFile& result) {
    const PersonId id = line.person();
    result.preferredSpouses[id] = line.person();
}

void readThrow(DirectiveLine& line, CaseFile& result) {
    const std::string_view name = line.field();
    std::size_t index = 0;
    while (index < kOperationNames.size() && kOperationNames[index] != name) ++index;
    if (index == kOperationNames.size()) line.fail("unknown operation '" + std::string(name) + "'");
    const auto call = line.number<std::int64_t>();
    if (call < 1) line.fail("bad number '" + std::to_string(call) + "': calls count from 1");
    result.failures[static_cast<HostOperation>(index)].insert(call);
}

const std::map<std::string_view, ReadDirective>& directives() {
    static const std::map<std::string_view, ReadDirective> table = {
        {"focus", readFocus},       {"view", readView},           {"adapter", readAdapter},
        {"option", readOption},     {"size", readSize},           {"sex", readSex},
        {"dead", readDead},         {"birth", readBirth},         {"date", readDate},
        {"father", readFather},     {"mother", readMother},       {"spouses", readSpouses},
        {"children", readChildren}, {"preferred", readPreferred}, {"throw", readThrow}};
    return table;
}

// Returns the name of the directive, empty for a line that is skipped.
std::string_view readLine(std::string_view text, const std::string& where, CaseFile& result) {
    if (!text.empty() && text.back() == '\r') text.remove_suffix(1);
    if (text.empty() || text.front() == '#') return {};
    DirectiveLine line(text, where);
    const std::string_view name = line.field();
    const auto found = directives().find(name);
    if (found == directives().end()) line.fail("unknown directive '" + std::string(name) + "'");
    found->second(line, result);
    line.expectEnd();
    return found->first;
}

// The double says the float exactly, so reading it as a double and narrowing it gives the same float.
std::string sizeText(float value) {
    std::array<char, 64> buffer{};
    std::snprintf(buffer.data(), buffer.size(), "%.17g", static_cast<double>(value));
    return buffer.data();
}

void formatRequest(const CaseFile& source, std::ostream& out) {
    out << "focus " << source.focus << '\n';
    if (source.view == CaseView::pedigree) {
        out << "view pedigree " << source.maxGenerations << ' ' << source.maxStackDepth << '\n';
    }
    if (source.adapter == CaseAdapter::bare) out << "adapter bare\n";
    for (const auto& [key, value] : source.options) out << "option " << key << ' ' << value << '\n';
    if (source.size == CaseSize()) return;
    out << "size " << sizeText(source.size.nodeWidth) << ' ' << sizeText(source.size.nodeHeight) << ' '
        << sizeText(source.size.horzPadding) << ' ' << sizeText(source.size.vertPadding) << ' '
        << sizeText(source.size.spouseLineStep) << ' ' << sizeText(source.size.lineInset) << '\n';
}

template <typename Value>
void formatEntry(const char* directive, const std::map<PersonId, Value>& entries, PersonId id,
                 std::ostream& out) {
    const auto found = entries.find(id);
    if (found != entries.end()) out << directive << ' ' << id << ' ' << found->second << '\n';
}

void formatList(const char* directive, const std::map<PersonId, std::vector<PersonId>>& entries, PersonId id,
                std::ostream& out) {
    const auto found = entries.find(id);
    if (found == entries.end()) return;
    out << directive << ' ' << id;
    for (const PersonId entry : found->second) out << ' ' << entry;
    out << '\n';
}

template <typename Value>
void addKeys(const std::map<PersonId, Value>& entries, std::set<PersonId>& ids) {
    for (const auto& entry : entries) ids.insert(entry.first);
}

std::set<PersonId> personsSpokenOf(const CaseFile& source) {
    std::set<PersonId> ids;
    addKeys(source.sexes, ids);
    addKeys(source.dead, ids);
    addKeys(source.births, ids);
    addKeys(source.dates, ids);
    addKeys(source.fathers, ids);
    addKeys(source.mothers, ids);
    addKeys(source.spouses, ids);
    addKeys(source.children, ids);
    addKeys(source.preferredSpouses, ids);
    return ids;
}

void formatPerson(const CaseFile& source, PersonId id, std::ostream& out) {
    formatEntry("sex", source.sexes, id, out);
    formatEntry("dead", source.dead, id, out);
    formatEntry("birth", source.births, id, out);
    formatEntry("date", source.dates, id, out);
    formatEntry("father", source.fathers, id, out);
    formatEntry("mother", source.mothers, id, out);
    formatList("spouses", source.spouses, id, out);
    formatList("children", source.children, id, out);
    formatEntry("preferred", source.preferredSpouses, id, out);
}

void formatFailures(const CaseFile& source, std::ostream& out) {
    for (const auto& [operation, calls] : source.failures) {
        for (const std::int64_t call : calls)
            out << "throw " << operationName(operation) << ' ' << call << '\n';
    }
}

template <typename Value>
Value answerOr(const std::map<PersonId, Value>& entries, PersonId id, Value otherwise) {
    const auto found = entries.find(id);
    return found == entries.end() ? otherwise : found->second;
}

}  // namespace

std::string_view operationName(HostOperation operation) {
    return kOperationNames.at(static_cast<std::size_t>(operation));
}

CaseFile parseCase(std::istream& text, const std::string& name) {
    CaseFile result;
    bool hasFocus = false;
    std::size_t lineNumber = 0;
    std::string line;
    while (std::getline(text, line)) {
        ++lineNumber;
        const std::string where = name + ":" + std::to_string(lineNumber) + ": ";
        hasFocus = readLine(line, where, result) == "focus" || hasFocus;
    }
    const std::string end = name + ":" + std::to_string(lineNumber) + ": ";
    if (text.bad()) throw std::runtime_error(end + "cannot be read");
    if (!hasFocus) throw std::runtime_error(end + "no focus");
    return result;
}

CaseFile parseCase(std::string_view text, const std::string& name) {
    std::istringstream stream{std::string(text)};
    return parseCase(stream, name);
}

CaseFile readCase(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    if (!file) throw std::runtime_error(path + ":0: cannot be read");
    return parseCase(file, path);
}

std::string formatCase(const CaseFile& source) {
    std::ostringstream out;
    formatRequest(source, out);
    for (const PersonId id : personsSpokenOf(source)) formatPerson(source, id, out);
    formatFailures(source, out);
    return out.str();
}

CaseHost::CaseHost(CaseFile source, bool traced)
    : CaseHost(std::make_shared<const CaseFile>(std::move(source)), traced) {}

CaseHost::CaseHost(std::shared_ptr<const CaseFile> source, bool traced)
    : family(std::move(source)), recordTrace(traced) {}

std::int64_t CaseHost::fatherForPersonWithID(std::int64_t personId) {
    noteCall(HostOperation::fatherForPersonWithID, personId);
    return answerOr(family->fathers, personId, kNotFound);
}

std::int64_t CaseHost::motherForPersonWithID(std::int64_t personId) {
    noteCall(HostOperation::motherForPersonWithID, personId);
    return answerOr(family->mothers, personId, kNotFound);
}

std::vector<std::int64_t> CaseHost::spousesForPersonWithID(std::int64_t personId) {
    noteCall(HostOperation::spousesForPersonWithID, personId);
    return answerOr(family->spouses, personId, {});
}

std::vector<std::int64_t> CaseHost::childrenForPersonWithID(std::int64_t personId) {
    noteCall(HostOperation::childrenForPersonWithID, personId);
    return answerOr(family->children, personId, {});
}

bool CaseHost::isPreferredSpouse(std::int64_t personId, std::int64_t spouseId) {
    noteCall(HostOperation::isPreferredSpouse, personId, spouseId);
    const auto found = family->preferredSpouses.find(personId);
    return found != family->preferredSpouses.end() && found->second == spouseId;
}

bool CaseHost::isPersonDead(std::int64_t personId) {
    noteCall(HostOperation::isPersonDead, personId);
    return answerOr(family->dead, personId, false);
}

std::string CaseHost::dateForPersonWithID(std::int64_t personId, bool isBirth) {
    noteCall(HostOperation::dateForPersonWithID, personId, isBirth ? 1 : 0);
    return answerOr(isBirth ? family->births : family->dates, personId, std::string());
}

std::int32_t CaseHost::sexOfPersonWithID(std::int64_t personId) {
    noteCall(HostOperation::sexOfPersonWithID, personId);
    return answerOr(family->sexes, personId, 0);
}

std::int64_t CaseHost::callCount() const {
    std::int64_t sum = 0;
    for (const std::int64_t count : counts) sum += count;
    return sum;
}

std::int64_t CaseHost::callCount(HostOperation operation) const {
    return counts.at(static_cast<std::size_t>(operation));
}

void CaseHost::noteCall(HostOperation operation, std::int64_t personId) {
    if (recordTrace) writeDown(operation, std::to_string(personId));
    countAndPerhapsFail(operation);
}

void CaseHost::noteCall(HostOperation operation, std::int64_t personId, std::int64_t second) {
    if (recordTrace) writeDown(operation, std::to_string(personId) + " " + std::to_string(second));
    countAndPerhapsFail(operation);
}

void CaseHost::writeDown(HostOperation operation, const std::string& arguments) {
    traceLines.push_back("call " + std::string(operationName(operation)) + " " + arguments);
}

void CaseHost::countAndPerhapsFail(HostOperation operation) {
    const std::int64_t call = ++counts.at(static_cast<std::size_t>(operation));
    const auto found = family->failures.find(operation);
    if (found == family->failures.end() || found->second.count(call) == 0) return;
    throw HostFailure(std::string(operationName(operation)) + " fails at call " + std::to_string(call));
}

std::set<PersonId> personsOf(const CaseFile& source) {
    std::set<PersonId> persons;
    const auto addKeysOf = [&persons](const auto& answers) {
        for (const auto& answer : answers) persons.insert(answer.first);
    };
    addKeysOf(source.fathers);
    addKeysOf(source.mothers);
    addKeysOf(source.spouses);
    addKeysOf(source.children);
    addKeysOf(source.preferredSpouses);
    addKeysOf(source.dead);
    addKeysOf(source.births);
    addKeysOf(source.dates);
    addKeysOf(source.sexes);
    return persons;
}

}  // namespace support
