// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Every person, segment and edge of a finished graph as text, so that two layouts can be compared to the last
// bit.

#include <support/GraphText.h>

#include <cstdint>
#include <cstdio>
#include <cstring>

namespace support {

namespace {

// -0.0 and 0.0 compare as equal, so they are printed alike.
std::string floatText(float value) {
    char digits[9];
    std::uint32_t bits = 0;
    if (value != 0.0f) std::memcpy(&bits, &value, sizeof bits);
    std::snprintf(digits, sizeof digits, "%08x", static_cast<unsigned>(bits));
    return digits;
}

std::string endsText(const TreeLineSegment& segment) {
    return floatText(segment.x1) + " " + floatText(segment.y1) + " " + floatText(segment.x2) + " " +
           floatText(segment.y2);
}

std::string courseText(const TreeLine& line) {
    std::string text = std::to_string(line.points().size());
    for (const TreePoint& point : line.points()) text += " " + floatText(point.x) + " " + floatText(point.y);
    return text;
}

std::string bit(bool value) {
    return value ? "1" : "0";
}

class GraphWriter {
public:
    explicit GraphWriter(const ViewerGlue& glue) : glue_(glue) {}

    void write(TreeViewPerson& person) {
        writePerson(person);
        writeSegments(person);
        writeSpouseLines(person);
        writeSpouseEdges(person);
        writeGenerationEdges(person);
    }

    std::vector<std::string> lines;

private:
    void writePerson(const TreeViewPerson& person) {
        const TreePoint at = person.getNodeCenter();
        lines.push_back("P " + std::to_string(person.personId) + " " + glue_.personOfKey(person.personId) +
                        " " + bit(person.gender) + " " + floatText(at.x) + " " + floatText(at.y) + " " +
                        bit(person.hasNonDisplayedRelationships) + " " + std::to_string(person.parentId));
    }

    void writeSegments(TreeViewPerson& person) {
        person.lineSegmentIterator([this](TreeLineSegment& segment) {
            lines.push_back("S " + endsText(segment) + " " + bit(segment.isSpouseLine));
        });
    }

    void writeSpouseLines(const TreeViewPerson& person) {
        for (const auto& [key, segments] : person.spouseLines) {
            for (const TreeLineSegment& segment : segments) {
                lines.push_back("L " + std::to_string(key) + " " + endsText(segment));
            }
        }
    }

    void writeSpouseEdges(TreeViewPerson& person) {
        person.spouseEdgeIterator([this](TreeViewSpouseEdge* edge) {
            lines.push_back("E " + std::to_string(edge->person->personId) + " " +
                            std::to_string(edge->spouse->personId) + " " + courseText(edge->line()));
            const auto first = edge->begin();
            for (auto child = first; child != edge->end(); ++child) {
                lines.push_back("C " + std::to_string((*child)->child->personId) + " " +
                                courseText((*child)->line()));
            }
        });
    }

    void writeGenerationEdges(TreeViewPerson& person) {
        person.generationEdgeIterator([this](TreeViewGenerationEdge* edge) {
            lines.push_back("G " + std::to_string(edge->child->personId) + " " +
                            std::to_string(edge->singleParent->personId) + " " + courseText(edge->line()));
        });
    }

    const ViewerGlue& glue_;
};

}  // namespace

std::vector<std::string> graphLines(SharedTreeViewer::TreeViewLayouter& layouter, const ViewerGlue& glue) {
    GraphWriter writer(glue);
    layouter.graphIterator([&writer](TreeViewPerson& person) { writer.write(person); });
    return writer.lines;
}

}  // namespace support
