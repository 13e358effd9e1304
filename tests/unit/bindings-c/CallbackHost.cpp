// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Cases through the C interface: callbacks that ask the case's data source, and options that say what the
// case says.

#include <unit/bindings-c/CallbackHost.h>

#include <map>
#include <stdexcept>

#include <olvane/family/FamilyOptions.h>

namespace unit {

namespace {

support::CaseHost& sourceOf(void* context) {
    return *static_cast<support::CaseHost*>(context);
}

template <class Question>
int answered(Question question) {
    try {
        question();
    } catch (const support::HostFailure&) {
        return kHostCode;
    }
    return 0;
}

void append(olvane_person_list* list, const std::vector<std::int64_t>& ids) {
    if (olvane_person_list_append(list, ids.data(), ids.size()) != OLVANE_OK) throw std::bad_alloc();
}

std::uint32_t shownOf(const support::CaseFile& request) {
    using namespace SharedTreeViewer;
    const std::map<std::string, std::uint32_t> bits = {
        {kTreeViewFamShowAuntsUnclesKey, OLVANE_SHOW_AUNTS_UNCLES},
        {kTreeViewFamShowCousinsKey, OLVANE_SHOW_COUSINS},
        {kTreeViewFamShowSiblingsKey, OLVANE_SHOW_SIBLINGS},
        {kTreeViewFamShowSiblingSpousesKey, OLVANE_SHOW_SIBLING_SPOUSES},
        {kTreeViewFamShowNeicesNephewsKey, OLVANE_SHOW_NIECES_NEPHEWS},
        {kTreeViewFamShowGrandchildrenKey, OLVANE_SHOW_GRANDCHILDREN},
        {kTreeViewFamShowGreatGrandparentsKey, OLVANE_SHOW_GREAT_GRANDPARENTS},
        {kTreeViewFamShowSpousesOfChildrenKey, OLVANE_SHOW_SPOUSES_OF_CHILDREN}};
    std::uint32_t shown = OLVANE_SHOW_ALL;
    for (const auto& [key, value] : request.options) {
        const auto bit = bits.find(key);
        if (bit != bits.end() && !value) shown &= ~bit->second;
    }
    return shown;
}

olvane_options optionsOf(const support::CaseFile& request) {
    olvane_options options;
    options.struct_size = sizeof options;
    options.sizes = {request.size.nodeWidth,   request.size.nodeHeight,     request.size.horzPadding,
                     request.size.vertPadding, request.size.spouseLineStep, request.size.lineInset};
    options.shown = shownOf(request);
    options.generations = request.view == support::CaseView::pedigree ? request.maxGenerations : 1;
    options.flag_depth = request.maxStackDepth;
    return options;
}

}  // namespace

CallbackHost::CallbackHost(support::CaseFile family, bool recordTrace)
    : source(std::move(family), recordTrace) {}

olvane_host CallbackHost::callbacks() {
    olvane_host host = {};
    host.struct_size = sizeof host;
    host.context = &source;
    host.father_of = [](void* context, std::int64_t person, std::int64_t* parent) {
        return answered([&] { *parent = sourceOf(context).fatherForPersonWithID(person); });
    };
    host.mother_of = [](void* context, std::int64_t person, std::int64_t* parent) {
        return answered([&] { *parent = sourceOf(context).motherForPersonWithID(person); });
    };
    host.spouses_of = [](void* context, std::int64_t person, olvane_person_list* spouses) {
        return answered([&] { append(spouses, sourceOf(context).spousesForPersonWithID(person)); });
    };
    host.children_of = [](void* context, std::int64_t person, olvane_person_list* children) {
        return answered([&] { append(children, sourceOf(context).childrenForPersonWithID(person)); });
    };
    host.is_preferred_spouse = [](void* context, std::int64_t person, std::int64_t spouse, int* preferred) {
        return answered([&] { *preferred = sourceOf(context).isPreferredSpouse(person, spouse) ? 1 : 0; });
    };
    host.is_dead = [](void* context, std::int64_t person, int* dead) {
        return answered([&] { *dead = sourceOf(context).isPersonDead(person) ? 1 : 0; });
    };
    host.date_of = [](void* context, std::int64_t person, int isBirth, olvane_date* date) {
        return answered([&] {
            olvane_date_set(date, sourceOf(context).dateForPersonWithID(person, isBirth != 0).c_str());
        });
    };
    host.sex_of = [](void* context, std::int64_t person, std::int32_t* sex) {
        return answered([&] { *sex = sourceOf(context).sexOfPersonWithID(person); });
    };
    return host;
}

std::string Answer::text() const {
    const char* text = nullptr;
    std::size_t length = 0;
    if (olvane_layout_text(layout.get(), &text, &length) != OLVANE_OK) throw std::logic_error("no text");
    return std::string(text, length);
}

std::vector<olvane_record> Answer::records() const {
    const olvane_record* records = nullptr;
    std::size_t count = 0;
    if (olvane_layout_records(layout.get(), &records, &count) != OLVANE_OK)
        throw std::logic_error("no records");
    return std::vector<olvane_record>(records, records + count);
}

int Answer::hostCode() const {
    int code = 0;
    if (olvane_layout_host_code(layout.get(), &code) != OLVANE_OK) throw std::logic_error("no code");
    return code;
}

Answer familyOf(const olvane_host& host, std::int64_t focus, const olvane_options* options) {
    olvane_layout* layout = nullptr;
    const olvane_status status = olvane_layout_family(&host, focus, options, &layout);
    return Answer{status, LayoutPointer(layout)};
}

Answer pedigreeOf(const olvane_host& host, std::int64_t focus, const olvane_options* options) {
    olvane_layout* layout = nullptr;
    const olvane_status status = olvane_layout_pedigree(&host, focus, options, &layout);
    return Answer{status, LayoutPointer(layout)};
}

Answer layoutOf(const support::CaseFile& request) {
    CallbackHost host(request);
    const olvane_options options = optionsOf(request);
    return request.view == support::CaseView::pedigree ? pedigreeOf(host.callbacks(), request.focus, &options)
                                                       : familyOf(host.callbacks(), request.focus, &options);
}

olvane::LayoutRecord readerForm(const olvane_record& record) {
    olvane::LayoutRecord form;
    form.id = record.id;
    form.x = record.x;
    form.y = record.y;
    form.hasHiddenRelatives = record.has_hidden_relatives != 0;
    for (std::size_t i = 0; i < record.segment_count; ++i) {
        const olvane_segment& piece = record.segments[i];
        form.segments.push_back({piece.x1, piece.y1, piece.x2, piece.y2});
    }
    if (record.kind != OLVANE_PERSON) {
        form.addNode = olvane::AddNodeSuffix{record.kind == OLVANE_MISSING_FATHER, record.child};
    }
    return form;
}

}  // namespace unit
