// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The order of rows to begin with: that of a walk over the family. Where everybody has one family above them at most, it
// has no crossings at all.

#include <olvane/charts/EverybodyOrderInternal.h>

#include <utility>

#include <olvane/kin/shared/Index.h>
#include <olvane/kin/shared/MergeSort.h>

namespace olvane::charts {

namespace {

using kin::at;

// What is still to be done is on a stack of the walk's own. Entered by one of its ends, a node has what hangs
// above its other ends on that side of it where they are.
class Walk {
public:
    explicit Walk(const Rows& rows)
        : rows_(rows), nodeMet_(at(rows.nodeCount()), 0), strandMet_(rows.strands.size(), 0) {
        order_.nodes.resize(at(rows.rowCount));
        order_.flipped.assign(at(rows.chainCount), 0);
    }

    RowOrder run() {
        for (std::int32_t node = 0; node < rows_.chainCount; ++node) {
            if (rows_.strandsAbove[node].empty()) walk(node);
        }
        for (std::int32_t node = 0; node < rows_.chainCount; ++node) walk(node);
        return std::move(order_);
    }

private:
    enum class Step : std::uint8_t { meetNode, placeNode, meetStrand };
    struct Task {
        Step step;
        std::int32_t what;
        std::int32_t sub;  // of a node: where it is entered from above; -1 for from below
    };

    void walk(std::int32_t first) {
        tasks_.push_back({Step::meetNode, first, -1});
        while (!tasks_.empty()) {
            const Task task = tasks_.back();
            tasks_.pop_back();
            later_.clear();
            switch (task.step) {
                case Step::meetNode:
                    meetNode(task.what, task.sub);
                    break;
                case Step::placeNode:
                    order_.nodes[at(rows_.row[at(task.what)])].push_back(task.what);
                    break;
                case Step::meetStrand:
                    meetStrand(task.what);
                    break;
            }
            tasks_.insert(tasks_.end(), later_.rbegin(), later_.rend());
        }
    }

    void meetNode(std::int32_t node, std::int32_t entered) {
        if (nodeMet_[at(node)] != 0) return;
        nodeMet_[at(node)] = 1;
        const auto all = rows_.endsAt[node];
        ends_.assign(all.begin(), all.end());
        kin::mergeSort(ends_.begin(), ends_.end(), [this](std::int32_t a, std::int32_t b) {
            return rows_.ends[at(a)].sub < rows_.ends[at(b)].sub;
        });
        const auto addStrands = [&](bool above, bool left) {
            for (const std::int32_t e : ends_) {
                if (rows_.isBelow(e) != above) continue;
                if (above && (rows_.ends[at(e)].sub < entered) != left) continue;
                later_.push_back({Step::meetStrand, rows_.strandOfEnd[at(e)], -1});
            }
        };
        addStrands(true, true);
        later_.push_back({Step::placeNode, node, -1});
        addStrands(false, false);
        addStrands(true, false);
    }

    void meetStrand(std::int32_t s) {
        if (strandMet_[at(s)] != 0) return;
        strandMet_[at(s)] = 1;
        const Rows::Strand& strand = rows_.strands[at(s)];
        for (const Rows::End& end : rows_.endsAbove(strand)) later_.push_back({Step::meetNode, end.node, -1});
        for (const Rows::End& end : rows_.endsBelow(strand))
            later_.push_back({Step::meetNode, end.node, end.sub});
    }

    const Rows& rows_;
    std::vector<std::uint8_t> nodeMet_;
    std::vector<std::uint8_t> strandMet_;
    std::vector<std::int32_t> ends_;
    std::vector<Task> tasks_;
    std::vector<Task> later_;
    RowOrder order_;
};

}  // namespace

RowOrder walkOrder(const Rows& rows) {
    return Walk(rows).run();
}

}  // namespace olvane::charts
