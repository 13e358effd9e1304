// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Rows by network simplex (Gansner, Koutsofios, North and Vo 1993): a tree of links that are as short as they
// may be, in which one link is exchanged for another for as long as that shortens the sum. The first tree is
// that of a walk over the family, and is nearly the last one: a family has few loops.

#include <olvane/charts/EverybodyLevelsInternal.h>

#include <algorithm>
#include <limits>

#include <olvane/kin/shared/Index.h>

namespace olvane::charts {

namespace {

using kin::at;

// head stands at least least rows below tail.
struct Link {
    std::int32_t tail;
    std::int32_t head;
    std::int32_t least;
};

class RowChoice {
public:
    RowChoice(const Component& part, const Chains& chains, std::int64_t effort)
        : chains_(chains), effort_(effort) {
        addLinks(part);
        dropLinksThatCloseRings();
        row_.assign(at(nodes_), 0);
    }

    std::vector<std::int32_t> choose() {
        walkForFirstRows();
        pushBelowParents();
        if (growTightTree()) {
            computeCuts();
            exchangeLinks();
        }
        return rowsFromZero();
    }

private:
    // Partners apart are joined by a node of their union, in neither's row or both's.
    void addLinks(const Component& part) {
        nodes_ = chains_.count();
        for (std::int32_t u = 0; u < part.unionCount(); ++u) {
            const auto& two = part.partners[at(u)];
            const std::int32_t one = two[0] >= 0 ? two[0] : two[1];
            std::int32_t from = chains_.chain[at(one)];
            if (two[0] >= 0 && two[1] >= 0 && chains_.chain[at(two[0])] != chains_.chain[at(two[1])]) {
                from = nodes_++;
                for (const std::int32_t partner : two)
                    links_.push_back({chains_.chain[at(partner)], from, 0});
            }
            for (const std::int32_t child : part.children[u]) {
                links_.push_back({from, chains_.chain[at(child)], 1});
            }
        }
    }

    void indexLinks() {
        below_.fill(at(nodes_), [this](const auto& visit) {
            for (std::size_t e = 0; e < links_.size(); ++e) {
                visit(links_[e].tail, static_cast<std::int32_t>(e));
            }
        });
        above_.fill(at(nodes_), [this](const auto& visit) {
            for (std::size_t e = 0; e < links_.size(); ++e) {
                visit(links_[e].head, static_cast<std::int32_t>(e));
            }
        });
    }

    // A walk downward in depth; a link to somebody whose descendants are being walked closes a ring. The order
    // in which the walk leaves the nodes, turned round, puts everybody behind their ancestors.
    void dropLinksThatCloseRings() {
        indexLinks();
        enum State : std::uint8_t { unmet, open, done };
        std::vector<State> state(at(nodes_), unmet);
        std::vector<std::uint8_t> dropped(links_.size(), 0);
        std::vector<std::pair<std::int32_t, std::size_t>> path;
        for (std::int32_t first = 0; first < nodes_; ++first) {
            if (state[at(first)] != unmet) continue;
            state[at(first)] = open;
            path.push_back({first, 0});
            while (!path.empty()) {
                const std::int32_t node = path.back().first;
                const auto below = below_[node];
                if (path.back().second == below.size()) {
                    state[at(node)] = done;
                    order_.push_back(node);
                    path.pop_back();
                    continue;
                }
                const std::int32_t e = below[path.back().second++];
                const std::int32_t head = links_[at(e)].head;
                if (state[at(head)] == open) dropped[at(e)] = 1;
                if (state[at(head)] != unmet) continue;
                state[at(head)] = open;
                path.push_back({head, 0});
            }
        }
        std::reverse(order_.begin(), order_.end());
        std::size_t kept = 0;
        for (std::size_t e = 0; e < links_.size(); ++e) {
            if (dropped[e] == 0) links_[kept++] = links_[e];
        }
        if (kept == links_.size()) return;
        links_.resize(kept);
        indexLinks();
    }

    void walkForFirstRows() {
        std::vector<std::uint8_t> met(at(nodes_), 0);
        std::vector<std::int32_t> queue;
        queue.reserve(at(nodes_));
        for (std::int32_t first = 0; first < nodes_; ++first) {
            if (met[at(first)] != 0) continue;
            met[at(first)] = 1;
            std::size_t next = queue.size();
            queue.push_back(first);
            for (; next < queue.size(); ++next) {
                const std::int32_t node = queue[next];
                const auto visit = [&](std::int32_t other, std::int32_t row) {
                    if (met[at(other)] != 0) return;
                    met[at(other)] = 1;
                    row_[at(other)] = row;
                    queue.push_back(other);
                };
                for (const std::int32_t e : below_[node]) {
                    visit(links_[at(e)].head, row_[at(node)] + links_[at(e)].least);
                }
                for (const std::int32_t e : above_[node]) {
                    visit(links_[at(e)].tail, row_[at(node)] - links_[at(e)].least);
                }
            }
        }
    }

    void pushBelowParents() {
        for (const std::int32_t node : order_) {
            for (const std::int32_t e : below_[node]) {
                const Link& link = links_[at(e)];
                row_[at(link.head)] = std::max(row_[at(link.head)], row_[at(node)] + link.least);
            }
        }
    }

    std::int32_t slack(std::int32_t e) const {
        const Link& link = links_[at(e)];
        return row_[at(link.head)] - row_[at(link.tail)] - link.least;
    }

    // Takes every link without slack that leads out of the tree; where there is none, moves the whole tree by
    // the least slack. False where the effort ends first.
    bool growTightTree() {
        treeLink_.assign(at(nodes_), -1);
        inTree_.assign(links_.size(), 0);
        std::vector<std::uint8_t> met(at(nodes_), 0);
        std::vector<std::int32_t> tree = {0};
        met[0] = 1;
        std::size_t next = 0;
        while (true) {
            for (; next < tree.size(); ++next) takeTightLinks(tree[next], met, tree);
            if (tree.size() == at(nodes_)) return true;
            effort_ -= static_cast<std::int64_t>(tree.size()) * 8;
            if (effort_ < 0) return false;
            const std::int32_t e = leastSlackOut(met, tree);
            if (e < 0) return false;
            const std::int32_t move = met[at(links_[at(e)].tail)] != 0 ? slack(e) : -slack(e);
            for (const std::int32_t node : tree) row_[at(node)] += move;
            const std::int32_t end =
                met[at(links_[at(e)].tail)] != 0 ? links_[at(e)].tail : links_[at(e)].head;
            takeTightLinks(end, met, tree);
        }
    }

    void takeTightLinks(std::int32_t node, std::vector<std::uint8_t>& met, std::vector<std::int32_t>& tree) {
        const auto take = [&](std::int32_t e, std::int32_t other) {
            if (met[at(other)] != 0 || slack(e) != 0) return;
            met[at(other)] = 1;
            treeLink_[at(other)] = e;
            inTree_[at(e)] = 1;
            tree.push_back(other);
        };
        for (const std::int32_t e : below_[node]) take(e, links_[at(e)].head);
        for (const std::int32_t e : above_[node]) take(e, links_[at(e)].tail);
    }

    std::int32_t leastSlackOut(const std::vector<std::uint8_t>& met,
                               const std::vector<std::int32_t>& tree) const {
        std::int32_t best = -1;
        for (const std::int32_t node : tree) {
            const auto look = [&](std::int32_t e, std::int32_t other) {
                if (met[at(other)] == 0 && (best < 0 || slack(e) < slack(best))) best = e;
            };
            for (const std::int32_t e : below_[node]) look(e, links_[at(e)].head);
            for (const std::int32_t e : above_[node]) look(e, links_[at(e)].tail);
        }
        return best;
    }

    // Numbers the tree so that a node's subtree is a range of numbers, and finds for each tree link how much
    // the sum of all links shrinks when its lower part is moved up: the cut.
    void computeCuts() {
        numberTree();
        cut_.assign(at(nodes_), 0);
        for (const std::int32_t node : byNumber_) cut_[at(node)] = cutOf(node);
    }

    std::int32_t otherEnd(std::int32_t e, std::int32_t node) const {
        const Link& link = links_[at(e)];
        return link.tail == node ? link.head : link.tail;
    }

    // byNumber_ lists each node behind all of its subtree.
    void numberTree() {
        up_.assign(at(nodes_), -1);
        low_.assign(at(nodes_), 0);
        number_.assign(at(nodes_), 0);
        byNumber_.clear();
        NumberLists treeBelow;
        treeLinks_.fill(at(nodes_), [this](const auto& visit) {
            for (std::size_t e = 0; e < links_.size(); ++e) {
                if (inTree_[e] == 0) continue;
                visit(links_[e].tail, static_cast<std::int32_t>(e));
                visit(links_[e].head, static_cast<std::int32_t>(e));
            }
        });
        std::vector<std::pair<std::int32_t, std::size_t>> path = {{0, 0}};
        while (!path.empty()) {
            const std::int32_t node = path.back().first;
            const auto list = treeLinks_[node];
            if (path.back().second == list.size()) {
                number_[at(node)] = static_cast<std::int32_t>(byNumber_.size());
                byNumber_.push_back(node);
                path.pop_back();
                continue;
            }
            const std::int32_t e = list[path.back().second++];
            if (e == up_[at(node)]) continue;
            const std::int32_t other = otherEnd(e, node);
            up_[at(other)] = e;
            low_[at(other)] = static_cast<std::int32_t>(byNumber_.size());
            path.push_back({other, 0});
        }
    }

    bool isBelow(std::int32_t node, std::int32_t top) const {
        return number_[at(node)] >= low_[at(top)] && number_[at(node)] <= number_[at(top)];
    }

    // From the cuts of the node's own tree links below, which are known.
    std::int32_t cutOf(std::int32_t node) const {
        const std::int32_t e = up_[at(node)];
        if (e < 0) return 0;
        // Sum over links between the subtree and the rest: +1 in the direction of e, -1 against it.
        const bool headBelow = links_[at(e)].head == node;
        std::int32_t into = 0;
        for (const std::int32_t link : above_[node]) into += contribution(link, node, 1);
        for (const std::int32_t link : below_[node]) into += contribution(link, node, -1);
        return headBelow ? into : -into;
    }

    // What a link at node adds to (links into the subtree - links out of it).
    std::int32_t contribution(std::int32_t link, std::int32_t node, std::int32_t sign) const {
        const std::int32_t other = otherEnd(link, node);
        if (inTree_[at(link)] != 0 && link != up_[at(node)]) {
            const bool headBelow = links_[at(link)].head == other;
            return headBelow ? cut_[at(other)] : -cut_[at(other)];
        }
        return isBelow(other, node) ? 0 : sign;
    }

    void exchangeLinks() {
        std::size_t from = 0;
        while (effort_ > 0) {
            std::int32_t leaving = -1;
            const std::size_t count = byNumber_.size();
            for (std::size_t i = 0; i < count && leaving < 0; ++i) {
                const std::int32_t node = byNumber_[(from + i) % count];
                if (up_[at(node)] >= 0 && cut_[at(node)] < 0) leaving = node;
            }
            effort_ -= static_cast<std::int64_t>(count);
            if (leaving < 0) return;
            from = static_cast<std::size_t>(number_[at(leaving)]) + 1;
            if (!exchange(leaving)) return;
        }
    }

    // The tree falls apart at the link above node; the link with the least slack that leads the other way
    // joins it again, once the subtree has moved by that slack.
    bool exchange(std::int32_t node) {
        const std::int32_t out = up_[at(node)];
        const bool headBelow = links_[at(out)].head == node;
        std::int32_t best = -1;
        for (std::int32_t i = low_[at(node)]; i <= number_[at(node)]; ++i) {
            const std::int32_t inside = byNumber_[at(i)];
            for (const std::int32_t e : headBelow ? below_[inside] : above_[inside]) {
                if (isBelow(otherEnd(e, inside), node)) continue;
                if (best < 0 || slack(e) < slack(best)) best = e;
            }
        }
        if (best < 0) return false;
        const std::int32_t move = headBelow ? slack(best) : -slack(best);
        for (std::int32_t i = low_[at(node)]; i <= number_[at(node)]; ++i) row_[at(byNumber_[at(i)])] += move;
        inTree_[at(out)] = 0;
        inTree_[at(best)] = 1;
        effort_ -= static_cast<std::int64_t>(links_.size()) * 8;
        computeCuts();
        return true;
    }

    std::vector<std::int32_t> rowsFromZero() const {
        std::vector<std::int32_t> rows(row_.begin(), row_.begin() + chains_.count());
        const std::int32_t first = *std::min_element(rows.begin(), rows.end());
        for (std::int32_t& row : rows) row -= first;
        return rows;
    }

    const Chains& chains_;
    std::int64_t effort_;
    std::int32_t nodes_ = 0;
    std::vector<Link> links_;
    NumberLists below_;  // links by tail
    NumberLists above_;  // links by head
    std::vector<std::int32_t> order_;
    std::vector<std::int32_t> row_;
    std::vector<std::int32_t> treeLink_;
    std::vector<std::uint8_t> inTree_;  // by link
    NumberLists treeLinks_;
    std::vector<std::int32_t> up_;      // by node, the tree link to the node above it in the tree
    std::vector<std::int32_t> cut_;     // by node, of that link
    std::vector<std::int32_t> low_;     // by node, the least number in its subtree
    std::vector<std::int32_t> number_;  // by node
    std::vector<std::int32_t> byNumber_;
};

}  // namespace

std::vector<std::int32_t> chooseRows(const Component& part, const Chains& chains, std::int64_t effort) {
    return RowChoice(part, chains, effort).choose();
}

}  // namespace olvane::charts
