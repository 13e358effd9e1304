// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The persons and families of an open file for JavaScript, some at a time: the numbers of their rows one after the other, and
// their texts as a JSON array, both in the order in which rows.mjs reads them. A family of 100,000 persons has five million
// numbers, which are neither written as digits nor read again.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <exception>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <olvane/gedcom/GedcomPeriod.h>
#include <olvane/picture/TextMetrics.h>
#include <olvane/source/GedcomLabels.h>

#include "JsonText.h"
#include "OpenFile.h"

#define OLVANE_EXPORT(name) extern "C" __attribute__((export_name(name)))

namespace olvane::js {
namespace {

// As JavaScript reads it from the memory.
struct Rows {
    const std::int32_t* numbers = nullptr;
    std::uint32_t numberCount = 0;
    const char* texts = nullptr;
    std::uint32_t textBytes = 0;
};

class RowWriter {
public:
    RowWriter() { texts_.begin(); }

    void write(const gedcom::GedcomData& data, const gedcom::Person& person, gedcom::PersonId id) {
        const gedcom::PersonName& name = data.firstName(id);
        text(person.xref);
        number(data.names(id).size());
        for (const gedcom::PersonName& each : data.names(id)) text(gedcom::displayName(each));
        text(name.given);
        text(name.surname);
        number(person.sex);
        number(person.dead);
        write(person.birth);
        write(person.death);
        number(person.father);
        number(person.mother);
        writeIds(data.spouses(id), [](gedcom::PersonId one) { return one; });
        writeIds(data.children(id), [](gedcom::PersonId one) { return one; });
        writeParentFamilies(data.parentLinks(id));
        writeIds(data.coupleLinks(id), [](const gedcom::FamilyLink& link) { return link.family; });
        number(gedcom::isSurnameFirst(name));
        writeCutName(name);
    }

    void write(const gedcom::GedcomData& data, const gedcom::Family& family, gedcom::FamilyId id) {
        number(family.husband);
        number(family.wife);
        writeIds(data.childLinks(id), [](const gedcom::ChildLink& link) { return link.child; });
        number(family.married);
        number(family.divorced);
        write(family.marriage);
    }

    // Live as long as this writer.
    Rows rows() {
        texts_.end();
        text_ = std::move(texts_).take();
        return {numbers_.data(), static_cast<std::uint32_t>(numbers_.size()), text_.data(),
                static_cast<std::uint32_t>(text_.size())};
    }

private:
    template <class Value>
    void number(Value value) {
        numbers_.push_back(static_cast<std::int32_t>(value));
    }

    void text(std::string_view value) { texts_.string(value); }

    // How many there are, and each; 0 stands for one that is not in the file, which is left out.
    template <class Ids, class IdOf>
    void writeIds(const Ids& ids, const IdOf& idOf) {
        const std::size_t counted = numbers_.size();
        number(0);
        for (const auto& one : ids) {
            if (idOf(one) != 0) number(idOf(one));
        }
        numbers_[counted] = static_cast<std::int32_t>(numbers_.size() - counted - 1);
    }

    void writeParentFamilies(std::span<const gedcom::FamilyLink> links) {
        number(std::count_if(links.begin(), links.end(),
                             [](const gedcom::FamilyLink& link) { return link.family != 0; }));
        for (const gedcom::FamilyLink& link : links) {
            if (link.family == 0) continue;
            number(link.family);
            number(link.pedigree);
        }
    }

    // 0 for a date that is not given; else 1 and its parts.
    void write(const gedcom::GedcomDate& date) {
        number(date.isGiven());
        if (!date.isGiven()) return;
        text(date.written);
        number(date.year);
        number(date.month);
        number(date.day);
        number(date.mark);
        number(date.lastYear);
        text(gedcom::displayYear(date));
        number(gedcom::isPeriod(date));
    }

    // The name as it is shown, where that is not the whole.
    void writeCutName(const gedcom::PersonName& name) {
        const std::string whole = gedcom::displayName(name);
        const bool isCut = whole.size() > picture::kMostTextBytes;
        number(isCut);
        if (isCut) text(picture::cutText(whole));
    }

    std::vector<std::int32_t> numbers_;
    JsonText texts_;
    std::string text_;
};

// What was asked for last.
std::optional<RowWriter> lastWriter;
Rows lastRows;

// The rows that row gives of ids from first on, at most `count`.
template <class Row>
const Rows* rowsOf(const gedcom::GedcomData& data, std::uint32_t first, std::uint32_t count, std::size_t all,
                   const Row& row) {
    try {
        lastWriter.emplace();
        const std::size_t end = std::min<std::size_t>(all + 1, std::size_t{first} + count);
        for (std::uint32_t id = std::max<std::uint32_t>(first, 1); id < end; ++id)
            lastWriter->write(data, row(id), id);
        lastRows = lastWriter->rows();
        return &lastRows;
    } catch (const std::exception& error) {
        lastText = error.what();
        return nullptr;
    }
}

}  // namespace
}  // namespace olvane::js

using namespace olvane;
using js::OpenFile;

// Rows live until the next call that gives some; null where there are none, and last_text says why.
OLVANE_EXPORT("gedcom_persons")
const js::Rows* gedcomPersons(const OpenFile* file, std::uint32_t first, std::uint32_t count) {
    const gedcom::GedcomData& data = file->data;
    return js::rowsOf(data, first, count, data.personCount(),
                      [&](std::uint32_t id) -> const gedcom::Person& { return data.person(id); });
}

OLVANE_EXPORT("gedcom_families")
const js::Rows* gedcomFamilies(const OpenFile* file, std::uint32_t first, std::uint32_t count) {
    const gedcom::GedcomData& data = file->data;
    return js::rowsOf(data, first, count, data.familyCount(),
                      [&](std::uint32_t id) -> const gedcom::Family& { return data.family(id); });
}

OLVANE_EXPORT("gedcom_person_count") std::size_t gedcomPersonCount(const OpenFile* file) {
    return file->data.personCount();
}

OLVANE_EXPORT("gedcom_family_count") std::size_t gedcomFamilyCount(const OpenFile* file) {
    return file->data.familyCount();
}

// Releases the rows, and makes what the first picture asks for: a copy of the memory then has no more than is needed, and a
// worker has done what the page would wait for. False where memory is short.
OLVANE_EXPORT("gedcom_prepare") int gedcomPrepare(OpenFile* file) {
    try {
        js::lastWriter.reset();
        file->kin();
        return 1;
    } catch (const std::exception&) {
        return 0;
    }
}
