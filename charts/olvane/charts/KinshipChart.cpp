// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <olvane/charts/TreeChartInternal.h>

#include <string>

#include <olvane/kin/Kinship.h>
#include <olvane/kin/KinshipText.h>
#include <olvane/picture/shared/WayLines.h>

namespace olvane::charts {

namespace {

// A way as it is drawn. Both of a couple at its top are shown, the one who is not on the way as its ancestor.
struct ChosenWay {
    picture::WayKind kind;
    const std::vector<kin::Place>* persons;
    const std::vector<kin::Place>* ancestors;  // null for a way by marriage
    std::string words;
};

// The ways that are asked for, those by blood first, each kind with its nearest first.
std::vector<ChosenWay> chooseWays(const kin::KinGraph& graph, const kin::Kinship& kinship,
                                  const ChartRequest& request) {
    const auto wordsOf = [&](const auto& way) { return kin::wayText(graph, way, request.language); };
    std::vector<ChosenWay> chosen;
    if (request.ways != WayChoice::marriage) {
        for (const kin::KinWay& way : kinship.blood) {
            chosen.push_back({picture::WayKind::blood, &way.persons, &way.ancestors, wordsOf(way)});
        }
        for (const kin::KinWay& way : kinship.legal) {
            chosen.push_back({picture::WayKind::legal, &way.persons, &way.ancestors, wordsOf(way)});
        }
    }
    if (request.ways != WayChoice::blood) {
        for (const kin::MarriageWay& way : kinship.marriage) {
            chosen.push_back({picture::WayKind::marriage, &way.persons, nullptr, wordsOf(way)});
        }
    }
    if (request.mostWays > 0 && chosen.size() > at(request.mostWays)) chosen.resize(at(request.mostWays));
    return chosen;
}

class WayWriter {
public:
    WayWriter(const kin::KinGraph& graph, picture::Picture& picture)
        : picture_(picture), boxOf_(at(graph.personCount()), kNone) {
        for (std::size_t box = 0; box < picture.boxes.size(); ++box) {
            boxOf_[at(graph.placeOf(picture.boxes[box].id))] = static_cast<Index>(box);
        }
    }

    Index boxOf(kin::Place person) const { return boxOf_[at(person)]; }

    void add(const ChosenWay& way) {
        picture::Way& added = picture_.ways.emplace_back();
        added.kind = way.kind;
        added.words = way.words;
        added.firstBox = static_cast<std::uint32_t>(picture_.wayBoxes.size());
        added.boxCount = static_cast<std::uint32_t>(way.persons->size());
        for (const kin::Place person : *way.persons) picture_.wayBoxes.push_back(boxOf_[at(person)]);
        if (way.ancestors == nullptr) return;
        added.ancestorCount = static_cast<std::uint32_t>(way.ancestors->size());
        for (const kin::Place person : *way.ancestors) picture_.wayBoxes.push_back(boxOf_[at(person)]);
    }

private:
    picture::Picture& picture_;
    std::vector<Index> boxOf_;
};

}  // namespace

picture::Picture kinshipChart(const kin::KinGraph& graph, const ChartRequest& request) {
    kin::KinshipLimits limits;
    if (request.mostWays > 0) limits.ways = at(request.mostWays);
    kin::KinshipFinder finder(graph);
    const kin::Kinship kinship = finder.between(request.focus, request.to, limits);
    const std::vector<ChosenWay> ways = chooseWays(graph, kinship, request);
    std::vector<kin::Place> persons{request.focus, request.to};
    for (const ChosenWay& way : ways) {
        persons.insert(persons.end(), way.persons->begin(), way.persons->end());
        if (way.ancestors != nullptr) {
            persons.insert(persons.end(), way.ancestors->begin(), way.ancestors->end());
        }
    }
    picture::Picture picture = treeChart(graph, request, selectionOf(graph, request.focus, persons));
    WayWriter writer(graph, picture);
    for (const ChosenWay& way : ways) writer.add(way);
    picture::addWayLines(picture);
    picture.other = writer.boxOf(request.to);
    picture.otherIs = kin::kinshipText(graph, kinship, request.language);
    picture.focusIs =
        kin::kinshipText(graph, finder.between(request.to, request.focus, limits), request.language);
    return picture;
}

}  // namespace olvane::charts
