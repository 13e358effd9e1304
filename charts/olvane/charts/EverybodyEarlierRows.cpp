// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The rows of an earlier chart: everybody who was there keeps theirs, and who is new gets one beside their nearest kin.

#include <olvane/charts/EverybodyEarlierInternal.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <map>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

double middleOf(const picture::Box& box) {
    return box.y + double{box.height} / 2;
}

class RowsAsBefore {
public:
    RowsAsBefore(const Component& part, const Chains& chains, const EarlierPicture& earlier)
        : part_(part), chains_(chains), earlier_(earlier) {
        rows_.rowOfChain.assign(at(chains.count()), kUnset);
    }

    EarlierRows keep(const std::vector<double>& widthOf) {
        if (!findMiddles(widthOf)) return {};
        for (std::int32_t chain = 0; chain < chains_.count(); ++chain) takeRow(chain);
        findRowsOfNew();
        countFromZero();
        return std::move(rows_);
    }

private:
    static constexpr std::int32_t kUnset = std::numeric_limits<std::int32_t>::min();
    static constexpr double kSameRow = 0.01;

    // The middles of all rows. False where the part is another one.
    bool findMiddles(const std::vector<double>& widthOf) {
        std::int32_t known = 0;
        for (std::int32_t person = 0; person < part_.personCount(); ++person) {
            const picture::Box* box = boxOf(part_, earlier_, person);
            if (box == nullptr || std::abs(double{box->width} - widthOf[at(person)]) > kSameRow) continue;
            ++known;
            middles_.push_back(middleOf(*box));
        }
        if (2 * known < part_.personCount()) return false;
        kin::mergeSort(middles_.begin(), middles_.end());
        const auto end = std::unique(middles_.begin(), middles_.end(),
                                     [](double a, double b) { return b - a <= kSameRow; });
        middles_.erase(end, middles_.end());
        return true;
    }

    std::int32_t rowOf(const picture::Box& box) const {
        const auto found = std::lower_bound(middles_.begin(), middles_.end(), middleOf(box) - kSameRow);
        return static_cast<std::int32_t>(found - middles_.begin());
    }

    // The row of most of its persons, the lowest of equally many.
    void takeRow(std::int32_t chain) {
        std::vector<std::int32_t> rows;
        for (const std::int32_t person : chains_.persons[chain]) {
            if (const picture::Box* box = boxOf(part_, earlier_, person)) rows.push_back(rowOf(*box));
        }
        kin::mergeSort(rows.begin(), rows.end());
        std::size_t most = 0;
        for (std::size_t first = 0, end = 0; first < rows.size(); first = end) {
            while (end < rows.size() && rows[end] == rows[first]) ++end;
            if (end - first < most) continue;
            most = end - first;
            rows_.rowOfChain[at(chain)] = rows[first];
        }
    }

    std::int32_t rowOfPerson(std::int32_t person) const {
        return rows_.rowOfChain[at(chains_.chain[at(person)])];
    }

    // Chains that are new, those beside known ones first.
    void findRowsOfNew() {
        std::vector<std::int32_t> queue;
        std::vector<std::uint8_t> queued(at(chains_.count()), 0);
        const auto enqueueAround = [&](std::int32_t chain) {
            forKin(chain, [&](std::int32_t person, int) {
                const std::int32_t other = chains_.chain[at(person)];
                if (rows_.rowOfChain[at(other)] != kUnset || queued[at(other)] != 0) return;
                queued[at(other)] = 1;
                queue.push_back(other);
            });
        };
        for (std::int32_t chain = 0; chain < chains_.count(); ++chain) {
            if (rows_.rowOfChain[at(chain)] != kUnset) enqueueAround(chain);
        }
        for (std::size_t next = 0; next < queue.size(); ++next) {
            rows_.rowOfChain[at(queue[next])] = rowBesideKin(queue[next]);
            enqueueAround(queue[next]);
        }
    }

    // visit(person, where): -1 for parents, 1 for children, 0 for siblings and partners.
    template <class Visit>
    void forKin(std::int32_t chain, const Visit& visit) const {
        for (const std::int32_t person : chains_.persons[chain]) {
            for (const std::int32_t u : part_.asChild[person]) {
                for (const std::int32_t parent : part_.partners[at(u)]) {
                    if (parent >= 0) visit(parent, -1);
                }
                for (const std::int32_t sibling : part_.children[u]) visit(sibling, 0);
            }
            for (const std::int32_t u : part_.asPartner[person]) {
                for (const std::int32_t partner : part_.partners[at(u)]) {
                    if (partner >= 0) visit(partner, 0);
                }
                for (const std::int32_t child : part_.children[u]) visit(child, 1);
            }
        }
    }

    // Beside siblings or partners where that is below all parents and above all children; else as near as can be.
    std::int32_t rowBesideKin(std::int32_t chain) const {
        std::int32_t above = kUnset;
        std::int32_t below = std::numeric_limits<std::int32_t>::max();
        std::int32_t beside = kUnset;
        forKin(chain, [&](std::int32_t person, int where) {
            const std::int32_t row = rowOfPerson(person);
            if (row == kUnset) return;
            if (where < 0) above = std::max(above, row);
            if (where > 0) below = std::min(below, row);
            if (where == 0) beside = std::max(beside, row);
        });
        if (beside != kUnset && beside > above && beside < below) return beside;
        if (above != kUnset) return above + 1;
        if (below != std::numeric_limits<std::int32_t>::max()) return below - 1;
        return beside;
    }

    // Rows that nobody is in any more are left out.
    void countFromZero() {
        std::map<std::int32_t, std::int32_t> used;
        for (const std::int32_t row : rows_.rowOfChain) used[row] = 0;
        std::int32_t next = 0;
        for (auto& [row, number] : used) {
            number = next++;
            const bool wasThere = row >= 0 && at(row) < middles_.size();
            rows_.middle.push_back(wasThere ? middles_[at(row)] : kUnknown);
        }
        for (std::int32_t& row : rows_.rowOfChain) row = used[row];
    }

    const Component& part_;
    const Chains& chains_;
    const EarlierPicture& earlier_;
    std::vector<double> middles_;
    EarlierRows rows_;
};

}  // namespace

EarlierRows rowsAsBefore(const Component& part, const Chains& chains, const EarlierPicture& earlier,
                         const std::vector<double>& widthOf) {
    return RowsAsBefore(part, chains, earlier).keep(widthOf);
}

}  // namespace olvane::charts
