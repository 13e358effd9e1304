// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// serve_borders INTERFACE SHAPE SIZE: serve_layouts for the interfaces of C++ and C: for each line with a number on its input it
// lays out that many times and answers with a line: the milliseconds of each layout, and behind a bar the persons shown.
//
//   cpp host text    the eight questions of a data source in memory; the interface that the others are held against
//   cpp table text   the table of the same family
//   cpp table typed  boxes and lines as values, without text
//   c host text      eight callbacks in C
//   c table text     the table handed over in C

#include <chrono>
#include <cstdlib>
#include <exception>
#include <functional>
#include <iostream>
#include <memory>
#include <stdexcept>
#include <string>

#include <olvane_family.h>

#include <olvane/boundary/TypedLayout.h>
#include <olvane/kin/FamilyDataSource.h>

#include "../FreedMemory.h"
#include "../MadeLayout.h"
#include "../MadeTable.h"

namespace {

typedef std::function<std::size_t()> Interface;  // one layout; the length of its result

olvane::Family tableOf(const bench::MadeColumns& made) {
    olvane::FamilyColumns columns;
    columns.persons.id = std::span(made.ids);
    columns.persons.father = std::span(made.fathers);
    columns.persons.mother = std::span(made.mothers);
    columns.persons.sex = std::span(made.sexes);
    columns.spouses.person = std::span(made.married);
    columns.spouses.spouse = std::span(made.spouses);
    columns.children.parent = std::span(made.parents);
    columns.children.child = std::span(made.children);
    return olvane::Family(columns);
}

Interface cppTable(const bench::MadeLayout& layout, const bench::MadeColumns& columns, bool typed) {
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source =
        std::make_shared<olvane::FamilyDataSource>(tableOf(columns));
    if (!typed) return [source, &layout] { return layout.textFrom(source).size(); };
    return [source] {
        olvane::LayoutOptions options;
        options.withText = false;
        return olvane::familyLayout(1, source, options).boxes.size();
    };
}

std::size_t lengthOf(olvane_status status, olvane_layout* layout) {
    if (status != OLVANE_OK) throw std::runtime_error(olvane_status_text(status));
    const char* text = nullptr;
    std::size_t length = 0;
    olvane_layout_text(layout, &text, &length);
    olvane_layout_free(layout);
    return length;
}

const bench::MadeFamily::Person& personOf(void* context, std::int64_t id) {
    return static_cast<const bench::MadeFamily*>(context)->person(id);
}

olvane_host hostOf(bench::MadeFamily& family) {
    olvane_host host = {};
    host.struct_size = sizeof host;
    host.context = &family;
    host.father_of = [](void* context, std::int64_t id, std::int64_t* parent) {
        if (personOf(context, id).father != 0) *parent = personOf(context, id).father;
        return 0;
    };
    host.mother_of = [](void* context, std::int64_t id, std::int64_t* parent) {
        if (personOf(context, id).mother != 0) *parent = personOf(context, id).mother;
        return 0;
    };
    host.spouses_of = [](void* context, std::int64_t id, olvane_person_list* list) {
        const auto& spouses = personOf(context, id).spouses;
        return static_cast<int>(olvane_person_list_append(list, spouses.data(), spouses.size()));
    };
    host.children_of = [](void* context, std::int64_t id, olvane_person_list* list) {
        const auto& children = personOf(context, id).children;
        return static_cast<int>(olvane_person_list_append(list, children.data(), children.size()));
    };
    host.is_preferred_spouse = [](void* context, std::int64_t id, std::int64_t spouse, int* preferred) {
        *preferred = personOf(context, id).spouses.front() == spouse ? 1 : 0;
        return 0;
    };
    host.is_dead = [](void*, std::int64_t, int*) { return 0; };
    host.date_of = [](void*, std::int64_t, int, olvane_date* date) {
        return static_cast<int>(olvane_date_set(date, ""));
    };
    host.sex_of = [](void* context, std::int64_t id, std::int32_t* sex) {
        *sex = personOf(context, id).sex;
        return 0;
    };
    return host;
}

Interface cHost(const bench::MadeFamily& made) {
    const auto family = std::make_shared<bench::MadeFamily>(made);
    return [family] {
        const olvane_host host = hostOf(*family);
        olvane_layout* layout = nullptr;
        const olvane_status status = olvane_layout_family(&host, 1, nullptr, &layout);
        return lengthOf(status, layout);
    };
}

Interface cTable(const bench::MadeColumns& made) {
    olvane_family_columns columns = {};
    const auto numbers = [](const std::vector<std::int64_t>& column) {
        return olvane_numbers{column.data(), column.size(), OLVANE_INT64};
    };
    columns.persons.id = numbers(made.ids);
    columns.persons.father = numbers(made.fathers);
    columns.persons.mother = numbers(made.mothers);
    columns.persons.sex = numbers(made.sexes);
    columns.spouses.person = numbers(made.married);
    columns.spouses.spouse = numbers(made.spouses);
    columns.children.parent = numbers(made.parents);
    columns.children.child = numbers(made.children);
    olvane_family* family = nullptr;
    olvane_family_error error = {};
    if (olvane_family_create(&columns, &family, &error) != OLVANE_OK) throw std::runtime_error(error.message);
    const std::shared_ptr<olvane_family> kept(family, olvane_family_free);
    return [kept] {
        olvane_layout* layout = nullptr;
        const olvane_status status = olvane_view(kept.get(), OLVANE_VIEW_FAMILY, 1, nullptr, &layout);
        return lengthOf(status, layout);
    };
}

void serve(const Interface& interface, std::size_t persons) {
    std::cout << "ready" << std::endl;
    std::size_t length = 0;
    for (int layouts = 0; std::cin >> layouts;) {
        for (int i = 0; i < layouts; ++i) {
            const auto start = std::chrono::steady_clock::now();
            length += interface();
            const auto taken = std::chrono::steady_clock::now() - start;
            std::cout << std::chrono::duration<double, std::milli>(taken).count() << ' ';
        }
        std::cout << "| " << (length > 0 ? persons : 0) << std::endl;
    }
}

}  // namespace

int main(int argc, char** argv) {
    bench::keepFreedMemory();
    if (argc != 4) {
        std::cerr << "usage: serve_borders 'cpp host text|cpp table text|...' desc|ego SIZE\n";
        return 2;
    }
    try {
        const std::string interface = argv[1];
        const bench::MadeFamily family = bench::madeFamily(argv[2], std::atoi(argv[3]));
        const bench::MadeLayout layout(argv[2], std::atoi(argv[3]));
        const bench::MadeColumns columns(family);
        const std::size_t persons = bench::shownPersons(layout.text());
        if (interface == "cpp host text") {
            serve([&layout] { return layout.text().size(); }, persons);
        } else if (interface == "cpp table text" || interface == "cpp table typed") {
            serve(cppTable(layout, columns, interface == "cpp table typed"), persons);
        } else if (interface == "c host text") {
            serve(cHost(family), persons);
        } else if (interface == "c table text") {
            serve(cTable(columns), persons);
        } else {
            throw std::invalid_argument("no such interface: " + interface);
        }
    } catch (const std::exception& error) {
        std::cerr << "serve_borders: " << error.what() << "\n";
        return 1;
    }
    return 0;
}
