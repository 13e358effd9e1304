// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// layouts-at-once FILE.ged CASEFILE...: lays out on four threads at once, and compares each result with the one
// that was made alone. Each person of the file is a focus in both views, over data that all threads read and over
// copies of its table that each thread changes; each
// case is laid out with its graph and its questions. The threads begin at different places, so that different
// layouts meet.
//
// layouts-at-once --race: two threads write one number, to prove that a race would be seen.

#include <cstddef>
#include <exception>
#include <functional>
#include <iostream>
#include <memory>
#include <string>
#include <thread>
#include <vector>

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/boundary/LayoutPieces.h>
#include <olvane/family/FamilyOptions.h>
#include <olvane/gedcom/GedcomReader.h>
#include <olvane/kin/FamilyDataSource.h>
#include <olvane/pedigree/TreeViewPedigreeLayouter.h>
#include <olvane/source/GedcomDataSource.h>
#include <olvane/source/GedcomFamily.h>
#include <support/CaseFile.h>
#include <support/CaseRun.h>

namespace {

using olvane::gedcom::GedcomData;
using olvane::gedcom::GedcomDataSource;

constexpr std::size_t kThreads = 4;
constexpr int kGenerations = 5;
constexpr int kStackDepth = 4;
constexpr std::size_t kFewestLayouts = 100;

using Layout = std::function<std::string()>;

std::string pedigreeText(const GedcomData& data, const std::string& focus) {
    ViewerGlue glue;
    const std::shared_ptr<OlvaneViewerManagerWrapProtocol> source = std::make_shared<GedcomDataSource>(data);
    const olvane::HostCallbacks callbacks(glue, source);
    olvane::resetAddParentId();
    DataAdapter adapter = callbacks.dataAdapter();
    const int focusKey = glue.getKeyFromPerson(focus);
    const int isMale = adapter.isMale(focusKey) ? 1 : 0;
    const SharedTreeViewer::OptionMap options = {{SharedTreeViewer::IndicateNonDisplayedRelationships, true}};
    SharedTreeViewer::TreeViewPedigreeLayouter layouter(&adapter, focusKey, isMale, options,
                                                        olvane::familyTreeSize(), kGenerations, kStackDepth);
    layouter.layoutForFocusNID();
    std::string text;
    olvane::ResultBounds bounds;
    layouter.graphIterator(olvane::resultWriter(glue, bounds, text));
    return text;
}

void addLayoutsOfFile(const GedcomData& data, std::vector<Layout>& layouts) {
    for (std::size_t number = 1; number <= data.personCount(); ++number) {
        const std::string focus = std::to_string(number);
        layouts.emplace_back(
            [&data, focus] { return FamilyViewLayout(focus, std::make_shared<GedcomDataSource>(data)); });
        layouts.emplace_back([&data, focus] { return pedigreeText(data, focus); });
    }
}

// The same of a table that all threads read, and of copies of it that each changes for itself.
void addLayoutsOfTable(const olvane::Family& table, std::vector<Layout>& layouts) {
    for (const olvane::FamilyId id : table.personIds()) {
        layouts.emplace_back([&table, id] {
            return FamilyViewLayout(std::to_string(id), std::make_shared<olvane::FamilyDataSource>(table));
        });
        layouts.emplace_back([&table, id] {
            olvane::Family copy = table;
            copy.setField(id, "note", "changed");
            olvane::PersonRow row = copy.person(id);
            row.father = 0;
            copy.setPerson(row);
            const olvane::Family other = copy;
            copy.removePerson(id);
            return FamilyViewLayout(std::to_string(id), std::make_shared<olvane::FamilyDataSource>(other));
        });
    }
}

void addLayoutOfCase(const std::string& file, std::vector<Layout>& layouts) {
    layouts.emplace_back([request = support::readCase(file)] {
        return support::joinLines(support::runCase(request, true, true));
    });
}

std::vector<std::string> makeAlone(const std::vector<Layout>& layouts) {
    std::vector<std::string> results;
    for (const Layout& layOut : layouts) results.push_back(layOut());
    return results;
}

// How many results differ from those that were made alone.
std::size_t differencesAtOnce(const std::vector<Layout>& layouts, const std::vector<std::string>& alone) {
    std::vector<std::size_t> differences(kThreads, 0);
    std::vector<std::thread> threads;
    for (std::size_t thread = 0; thread < kThreads; ++thread) {
        threads.emplace_back([&layouts, &alone, &differences, thread] {
            const std::size_t first = thread * layouts.size() / (kThreads * 2);
            for (std::size_t step = 0; step < layouts.size(); ++step) {
                const std::size_t place = (first + step) % layouts.size();
                if (layouts[place]() != alone[place]) ++differences[thread];
            }
        });
    }
    std::size_t all = 0;
    for (std::size_t thread = 0; thread < kThreads; ++thread) {
        threads[thread].join();
        all += differences[thread];
    }
    return all;
}

int race() {
    int shared = 0;
    std::thread other([&shared] { ++shared; });
    ++shared;
    other.join();
    std::cout << shared << "\n";
    return 0;
}

int run(const std::vector<std::string>& files) {
    const GedcomData data = olvane::gedcom::readGedcomFile(files.front());
    std::vector<Layout> layouts;
    addLayoutsOfFile(data, layouts);
    const olvane::Family table = olvane::gedcom::familyOf(data);
    addLayoutsOfTable(table, layouts);
    for (std::size_t i = 1; i < files.size(); ++i) addLayoutOfCase(files[i], layouts);
    const std::vector<std::string> alone = makeAlone(layouts);
    const std::size_t differences = differencesAtOnce(layouts, alone);
    std::cout << layouts.size() << " layouts on each of " << kThreads << " threads, " << differences
              << " differ from those made alone\n";
    return differences == 0 && layouts.size() >= kFewestLayouts ? 0 : 1;
}

}  // namespace

int main(int argc, char** argv) {
    const std::vector<std::string> arguments(argv + 1, argv + argc);
    if (arguments == std::vector<std::string>{"--race"}) return race();
    if (arguments.empty()) {
        std::cerr << "usage: layouts-at-once FILE.ged CASEFILE...\n";
        return 2;
    }
    try {
        return run(arguments);
    } catch (const std::exception& failure) {
        std::cerr << "layouts-at-once: " << failure.what() << "\n";
        return 2;
    }
}
