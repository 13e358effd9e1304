// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How changed rows come into a table without a moment in which half of them are there.

#include <olvane/kin/FamilyEditInternal.h>

#include <algorithm>
#include <iterator>
#include <memory>

#include <olvane/kin/shared/MergeSort.h>

namespace olvane {

using detail::Reference;
using detail::StoredFamily;
using detail::StoredPerson;

namespace {

// A table is tidied when texts and lists that nobody refers to, or rows that were removed, may be over half of it.
constexpr std::size_t kLeastWordsToTidy = 65536;
constexpr std::size_t kLeastRowsToTidy = 256;

}  // namespace

FamilyEdit::FamilyEdit(Family& family) : family_(family) {
    Family::State*& state = family_.state_;
    if (state == nullptr) {
        state = new Family::State;
    } else if (state->owners.load(std::memory_order_acquire) != 1) {
        Family::State* const own = new Family::State(*state);
        Family::State::release(state);
        state = own;
    }
}

StoredPerson& FamilyEdit::draftOf(FamilyId person) {
    for (PersonDraft& draft : persons_) {
        if (draft.person.id == person) return draft.person;
    }
    return newDraftOf(state().personRow(person));
}

StoredPerson& FamilyEdit::newDraftOf(std::uint32_t row) {
    return persons_.emplace_back(PersonDraft{row, state().persons[row]}).person;
}

StoredFamily& FamilyEdit::draftOfFamily(std::uint32_t row) {
    return families_.emplace_back(FamilyDraft{row, state().families[row]}).family;
}

void FamilyEdit::addPerson(const StoredPerson& person) {
    persons_.push_back({static_cast<std::uint32_t>(state().persons.size()), person});
    addsPerson_ = true;
}

void FamilyEdit::addFamily(const StoredFamily& family) {
    families_.push_back({static_cast<std::uint32_t>(state().families.size()), family});
    addsFamily_ = true;
}

void FamilyEdit::removePerson(std::uint32_t row) {
    removedPerson_ = state().persons[row].id;
}

void FamilyEdit::removeFamily(std::uint32_t row) {
    removedFamilies_.push_back(row);
}

Reference FamilyEdit::withAll(Reference list, std::span<const FamilyId> ids) {
    const std::span<const FamilyId> old = blobs().list(list);
    std::vector<FamilyId> sorted(old.begin(), old.end());
    kin::mergeSort(sorted.begin(), sorted.end());
    std::vector<FamilyId> longer(old.begin(), old.end());
    for (const FamilyId id : ids) {
        if (!std::binary_search(sorted.begin(), sorted.end(), id)) longer.push_back(id);
    }
    return longer.size() == old.size() ? list : blobs().add(std::span<const FamilyId>(longer));
}

Reference FamilyEdit::without(Reference list, FamilyId id) {
    const std::span<const FamilyId> old = blobs().list(list);
    std::vector<FamilyId> shorter;
    std::copy_if(old.begin(), old.end(), std::back_inserter(shorter),
                 [id](FamilyId one) { return one != id; });
    return shorter.size() == old.size() ? list : blobs().add(std::span<const FamilyId>(shorter));
}

// Everything that may fail where memory is short. Its effects are not visible: room, and chunks that are the table's own.
void FamilyEdit::prepare() {
    Family::State& own = *family_.state_;
    if (addsPerson_) {
        for (const PersonDraft& draft : persons_) {
            if (draft.row == own.persons.size()) own.personIndex.prepareToAdd(draft.person.id);
        }
        own.persons.prepareToAdd();
    }
    if (addsFamily_) {
        own.familyIndex.prepareToAdd(families_.back().family.number);
        own.families.prepareToAdd();
    }
    for (const PersonDraft& draft : persons_) {
        if (draft.row < own.persons.size()) own.persons.edit(draft.row);
    }
    for (const FamilyDraft& draft : families_) {
        if (draft.row < own.families.size()) own.families.edit(draft.row);
    }
    if (removedPerson_ != 0) {
        own.persons.edit(own.personRow(removedPerson_));
        own.personIndex.prepareToRemove(removedPerson_);
    }
    for (const std::uint32_t row : removedFamilies_) {
        own.families.edit(row);
        own.familyIndex.prepareToRemove(own.families[row].number);
    }
}

void FamilyEdit::commit() {
    prepare();
    Family::State& own = *family_.state_;
    for (const PersonDraft& draft : persons_) {
        if (draft.row < own.persons.size()) {
            own.persons.edit(draft.row) = draft.person;
        } else {
            own.personIndex.add(draft.person.id);
            own.persons.add(draft.person);
            ++own.personCount;
        }
    }
    for (const FamilyDraft& draft : families_) {
        if (draft.row < own.families.size()) {
            own.families.edit(draft.row) = draft.family;
        } else {
            own.familyIndex.add(draft.family.number);
            own.families.add(draft.family);
            ++own.familyCount;
        }
    }
    if (removedPerson_ != 0) {
        own.persons.edit(own.personRow(removedPerson_)) = StoredPerson();
        own.personIndex.remove(removedPerson_);
        --own.personCount;
    }
    for (const std::uint32_t row : removedFamilies_) {
        own.familyIndex.remove(own.families[row].number);
        own.families.edit(row) = StoredFamily();
        --own.familyCount;
    }
    tidy();
}

// Done for room's sake alone, so an edit has not failed where there is no memory for it.
void FamilyEdit::tidy() noexcept {
    const Family::State& own = state();
    const bool manyWords = own.blobs.addedWords() > 2 * own.tidyWords + kLeastWordsToTidy;
    const bool manyRows = own.persons.size() > 2 * own.personCount + kLeastRowsToTidy ||
                          own.families.size() > 2 * own.familyCount + kLeastRowsToTidy;
    if (!manyWords && !manyRows) return;
    try {
        Family::State* const smaller = tidied();
        Family::State::release(family_.state_);
        family_.state_ = smaller;
    } catch (...) {
        // The table stays as large as it is, and the next edit tries again.
    }
}

namespace {

// What is moved from one table's texts and lists to another's.
struct BlobMove {
    const detail::BlobStore& from;
    detail::BlobStore& to;

    void text(Reference& text) const { text = to.add(from.text(text)); }
    void list(Reference& list) const { list = to.add(from.list(list)); }
    void date(Reference& sorting, Reference& written) const {
        const bool isOne = sorting == written;
        text(sorting);
        if (isOne) {
            written = sorting;
        } else {
            text(written);
        }
    }
};

}  // namespace

Family::State* FamilyEdit::tidied() const {
    auto smaller = std::make_unique<Family::State>();
    const Family::State& old = state();
    const BlobMove move{old.blobs, smaller->blobs};
    for (std::size_t row = 0; row < old.persons.size(); ++row) {
        StoredPerson person = old.persons[row];
        if (person.id == 0) continue;
        move.date(person.birth, person.birthWritten);
        move.date(person.death, person.deathWritten);
        move.text(person.names);
        move.text(person.fields);
        move.list(person.spouses);
        move.list(person.children);
        smaller->personIndex.add(person.id);
        smaller->persons.add(person);
    }
    for (std::size_t row = 0; row < old.families.size(); ++row) {
        StoredFamily family = old.families[row];
        if (family.number == 0) continue;
        move.date(family.marriage, family.marriageWritten);
        move.text(family.marriagePlace);
        move.text(family.kinds);
        move.list(family.children);
        smaller->familyIndex.add(family.number);
        smaller->families.add(family);
    }
    smaller->fieldKeys = old.fieldKeys;
    smaller->personCount = old.personCount;
    smaller->familyCount = old.familyCount;
    smaller->tidyWords = smaller->blobs.addedWords();
    return smaller.release();
}

}  // namespace olvane
