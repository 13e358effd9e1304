// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <istream>
#include <map>
#include <memory>
#include <set>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace support {

using PersonId = std::int64_t;

// What a host answers when it knows no father or no mother.
constexpr PersonId kNotFound = 0x7fffffffffffffff;

// The eight questions that a data source answers, in the order in which a host declares them.
enum class HostOperation {
    fatherForPersonWithID,
    motherForPersonWithID,
    spousesForPersonWithID,
    childrenForPersonWithID,
    isPreferredSpouse,
    isPersonDead,
    dateForPersonWithID,
    sexOfPersonWithID
};

constexpr std::size_t kHostOperationCount = 8;

std::string_view operationName(HostOperation operation);

enum class CaseView { family, pedigree };

// host: an unknown parent gets a negative id. bare: an unknown parent stays unset.
enum class CaseAdapter { host, bare };

// The six sizes of a drawing, in its points.
struct CaseSize {
    float nodeWidth = 55.0F;
    float nodeHeight = 80.0F;
    float horzPadding = 25.0F;
    float vertPadding = 30.0F;
    float spouseLineStep = 10.0F;
    float lineInset = 0.0F;

    bool operator==(const CaseSize&) const = default;
};

// A family and one layout request for it, as a case file states them.
//
// Holds: a person without an entry in a map has that map's default answer: no parent, no spouses, no
//        children, no preferred spouse, alive, empty dates, sex 0.
struct CaseFile {
    PersonId focus = 0;
    CaseView view = CaseView::family;
    std::int32_t maxGenerations = 0;  // read for a pedigree only
    std::int32_t maxStackDepth = 4;   // read for a pedigree only
    CaseAdapter adapter = CaseAdapter::host;
    std::map<std::string, bool> options;
    CaseSize size;

    std::map<PersonId, PersonId> fathers;
    std::map<PersonId, PersonId> mothers;
    std::map<PersonId, std::vector<PersonId>> spouses;
    std::map<PersonId, std::vector<PersonId>> children;
    std::map<PersonId, PersonId> preferredSpouses;
    std::map<PersonId, bool> dead;
    std::map<PersonId, std::string> births;  // the date with isBirth true
    std::map<PersonId, std::string> dates;   // the date with isBirth false
    std::map<PersonId, std::int32_t> sexes;

    // The calls, counted from 1 for each operation, that fail.
    std::map<HostOperation, std::set<std::int64_t>> failures;

    bool operator==(const CaseFile&) const = default;
};

// Both fail with std::runtime_error, "name:line: reason", on an unknown directive, a missing or surplus
// field, a bad number, or a case without a focus. readCase also fails on a file that cannot be read.
CaseFile parseCase(std::istream& text, const std::string& name);
CaseFile parseCase(std::string_view text, const std::string& name = "case");
CaseFile readCase(const std::string& path);

// The case as text in a fixed order of directives, for messages; parseCase gives the same case back.
// Directives that say what is the default anyway are left out, but for entries of the maps.
std::string formatCase(const CaseFile& source);

// The persons of whom a case speaks, each once, by ascending id: those with answers of their own.
std::set<PersonId> personsOf(const CaseFile& source);

// Raised by CaseHost where the case says that a call fails.
class HostFailure : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The case for a host that does not outlive it: nothing is copied, nothing owned.
inline std::shared_ptr<const CaseFile> borrowed(const CaseFile& source) {
    return std::shared_ptr<const CaseFile>(std::shared_ptr<const CaseFile>(), &source);
}

// A data source that answers as a case says, counts the calls, and writes them down when asked to.
//
// Fails: any operation throws HostFailure at the calls that the case names; such a call is counted and
//        written down as well.
class CaseHost {
public:
    explicit CaseHost(CaseFile family, bool recordTrace = false);
    explicit CaseHost(std::shared_ptr<const CaseFile> family, bool recordTrace = false);

    std::int64_t fatherForPersonWithID(std::int64_t personId);
    std::int64_t motherForPersonWithID(std::int64_t personId);
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t personId);
    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t personId);
    bool isPreferredSpouse(std::int64_t personId, std::int64_t spouseId);
    bool isPersonDead(std::int64_t personId);
    std::string dateForPersonWithID(std::int64_t personId, bool isBirth);
    std::int32_t sexOfPersonWithID(std::int64_t personId);

    std::int64_t callCount() const;  // of all operations together
    std::int64_t callCount(HostOperation operation) const;

    // One line for each call in the order made, "call <operation> <arguments>"; empty unless recorded.
    const std::vector<std::string>& trace() const { return traceLines; }

private:
    void noteCall(HostOperation operation, std::int64_t personId);
    void noteCall(HostOperation operation, std::int64_t personId, std::int64_t second);
    void writeDown(HostOperation operation, const std::string& arguments);
    void countAndPerhapsFail(HostOperation operation);

    std::shared_ptr<const CaseFile> family;
    bool recordTrace;
    std::array<std::int64_t, kHostOperationCount> counts{};
    std::vector<std::string> traceLines;
};

}  // namespace support
