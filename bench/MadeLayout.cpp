// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Layouts by name, each in the view that shows its family whole.

#include "MadeLayout.h"

#include <set>
#include <stdexcept>
#include <utility>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/LayoutPieces.h>
#include <olvane/host/LayoutText.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>

namespace bench {

namespace {

constexpr int kStackDepth = 4;

std::string pedigreeText(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source, int generations) {
    ViewerGlue glue;
    const olvane::HostCallbacks callbacks(glue, source);
    std::string text;
    olvane::resetAddParentId();
    olvane::guarded([&] {
        DataAdapter adapter = callbacks.dataAdapter();
        const int focusKey = glue.getKeyFromPerson("1");
        const int isMale = adapter.isMale(focusKey) ? 1 : 0;
        SharedTreeViewer::TreeViewPedigreeLayouter layouter(
            &adapter, focusKey, isMale, SharedTreeViewer::OptionMap(), olvane::familyTreeSize(), generations,
            kStackDepth);
        layouter.layoutForFocusNID();
        olvane::ResultBounds bounds;
        layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
    });
    return text;
}

}  // namespace

MadeFamily madeFamily(std::string_view shape, int size) {
    if (shape == "desc") return MadeFamily::descendants(size);
    if (shape == "ego") return MadeFamily::kin(size);
    if (shape == "ped") return MadeFamily::ancestors(size);
    throw std::invalid_argument("no such shape: " + std::string(shape));
}

MadeLayout::MadeLayout(std::string shape, int size) : shape_(std::move(shape)), size_(size), persons_(0) {
    MadeFamily family = madeFamily(shape_, size);
    persons_ = family.size();
    source_ = std::make_shared<MadeFamilySource>(std::move(family));
}

std::string MadeLayout::textFrom(const std::shared_ptr<OlvaneViewerManagerWrapProtocol>& source) const {
    return shape_ == "ped" ? pedigreeText(source, size_ + 1) : FamilyViewLayout("1", source);
}

olvane::TypedLayout MadeLayout::typed(bool withText) const {
    olvane::LayoutOptions options;
    options.withText = withText;
    if (shape_ != "ped") return olvane::familyLayout(1, source_, options);
    options.generations = size_ + 1;
    return olvane::pedigreeLayout(1, source_, options);
}

const std::vector<LayoutName>& layoutsOfTheTables() {
    static const std::vector<LayoutName> layouts = {
        {"desc", 30},  {"desc", 100},  {"desc", 1003}, {"desc", 9998}, {"ego", 30}, {"ego", 100},
        {"ego", 1000}, {"ego", 10000}, {"ped", 4},     {"ped", 6},     {"ped", 9},  {"ped", 12}};
    return layouts;
}

std::size_t shownPersons(const std::string& text) {
    std::set<std::int64_t> persons;
    for (const olvane::LayoutRecord& record : olvane::readLayoutText(text)) {
        if (record.id > 0) persons.insert(record.id);
    }
    return persons.size();
}

}  // namespace bench
