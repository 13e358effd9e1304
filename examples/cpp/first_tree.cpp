// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A first tree: five persons of the program's own, laid out around Henry and drawn to tree.svg.

#include <olvane/boundary/FamilyViewLayout.h>
#include <olvane/host/LayoutText.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <memory>
#include <string>
#include <vector>

struct Person {
    std::string name;
    bool male;
    std::int64_t father;  // 0 where not known
    std::int64_t mother;
};

const std::map<std::int64_t, Person> kPersons = {{1, {"Henry", true, 4, 5}},
                                                 {2, {"Anne", false, 0, 0}},
                                                 {3, {"Elizabeth", false, 1, 2}},
                                                 {4, {"Edmund", true, 0, 0}},
                                                 {5, {"Margaret", false, 0, 0}}};

class MyFamily : public OlvaneViewerManagerWrapProtocol {
public:
    std::int64_t fatherForPersonWithID(std::int64_t id) override { return known(kPersons.at(id).father); }
    std::int64_t motherForPersonWithID(std::int64_t id) override { return known(kPersons.at(id).mother); }

    // Everyone who has a child with the person.
    std::vector<std::int64_t> spousesForPersonWithID(std::int64_t id) override {
        std::vector<std::int64_t> spouses;
        for (const std::int64_t child : childrenForPersonWithID(id)) {
            const Person& person = kPersons.at(child);
            const std::int64_t other = person.father == id ? person.mother : person.father;
            const bool isNew = std::find(spouses.begin(), spouses.end(), other) == spouses.end();
            if (other != 0 && isNew) spouses.push_back(other);
        }
        return spouses;
    }

    std::vector<std::int64_t> childrenForPersonWithID(std::int64_t id) override {
        std::vector<std::int64_t> children;
        for (const auto& [child, person] : kPersons) {
            if (person.father == id || person.mother == id) children.push_back(child);
        }
        return children;
    }

    bool isPreferredSpouse(std::int64_t id, std::int64_t spouse) override {
        return spousesForPersonWithID(id).front() == spouse;
    }
    bool isPersonDead(std::int64_t) override { return true; }
    std::string dateForPersonWithID(std::int64_t, bool) override { return ""; }
    std::int32_t sexOfPersonWithID(std::int64_t id) override { return kPersons.at(id).male ? 0 : 1; }

private:
    static std::int64_t known(std::int64_t parent) { return parent == 0 ? kPersonNotFound : parent; }
};

void draw(const std::vector<olvane::LayoutRecord>& records, std::ostream& svg) {
    constexpr int kWidth = 55;
    constexpr int kHeight = 80;
    int left = 0, top = 0, right = 0, bottom = 0;
    for (const olvane::LayoutRecord& box : records) {
        left = std::min(left, box.x - 10);
        top = std::min(top, box.y - 10);
        right = std::max(right, box.x + kWidth + 10);
        bottom = std::max(bottom, box.y + kHeight + 10);
    }
    svg << "<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"" << left << " " << top << " " << right - left
        << " " << bottom - top << "\">\n";
    for (const olvane::LayoutRecord& box : records) {
        for (const olvane::LayoutSegment& line : box.segments) {
            svg << "<path d=\"M" << line.x1 << " " << line.y1 << "L" << line.x2 << " " << line.y2
                << "\" stroke=\"black\"/>\n";
        }
    }
    for (const olvane::LayoutRecord& box : records) {
        const std::string name = box.addNode ? "?" : kPersons.at(box.id).name;
        svg << "<rect x=\"" << box.x << "\" y=\"" << box.y << "\" width=\"" << kWidth << "\" height=\""
            << kHeight << "\" fill=\"white\" stroke=\"black\"/>\n";
        svg << "<text x=\"" << box.x + 4 << "\" y=\"" << box.y + 44 << "\" font-size=\"10\">" << name
            << "</text>\n";
    }
    svg << "</svg>\n";
}

int main() {
    const std::string text = FamilyViewLayout("1", std::make_shared<MyFamily>());
    std::ofstream svg("tree.svg");
    draw(olvane::readLayoutText(text), svg);
    return text.empty() ? 1 : 0;
}
