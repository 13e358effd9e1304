// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include <olvane/kin/FamilyChecksInternal.h>
#include <olvane/kin/FamilyStateInternal.h>

namespace olvane {

// One edit of a table: changed rows are drawn up beside it, everything that needs memory is done, and only then are
// they put in their places. So a table is as it was when an edit fails.
//
// Holds: for one edit; commit is called at most once, last.
class FamilyEdit {
public:
    // The table's state becomes its own, if copies share it.
    explicit FamilyEdit(Family& family);

    const Family::State& state() const { return *family_.state_; }
    detail::BlobStore& blobs() { return family_.state_->blobs; }
    std::vector<std::string>& fieldKeys() { return family_.state_->fieldKeys; }

    // The row as it shall be; the reference lives until the next row is asked for.
    detail::StoredPerson& draftOf(FamilyId person);
    // The same, for a row that has no draft yet.
    detail::StoredPerson& newDraftOf(std::uint32_t row);
    detail::StoredFamily& draftOfFamily(std::uint32_t row);
    // A new row, which draftOf finds too.
    void addPerson(const detail::StoredPerson& person);
    void addFamily(const detail::StoredFamily& family);
    // The row is taken out; its draft keeps its number until then.
    void removePerson(std::uint32_t row);
    void removeFamily(std::uint32_t row);

    // The list with those who are missing in it at its end.
    detail::Reference withAll(detail::Reference list, std::span<const FamilyId> ids);
    detail::Reference without(detail::Reference list, FamilyId id);

    void commit();

private:
    struct PersonDraft {
        std::uint32_t row;
        detail::StoredPerson person;
    };
    struct FamilyDraft {
        std::uint32_t row;
        detail::StoredFamily family;
    };

    void prepare();
    void tidy() noexcept;
    Family::State* tidied() const;

    Family& family_;
    std::vector<PersonDraft> persons_;
    std::vector<FamilyDraft> families_;
    bool addsPerson_ = false;
    bool addsFamily_ = false;
    FamilyId removedPerson_ = 0;
    std::vector<std::uint32_t> removedFamilies_;
};

}  // namespace olvane
