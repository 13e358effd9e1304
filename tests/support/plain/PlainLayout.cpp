// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One request to the plain layout: the frame around a view, the result text, and the finished chart as lines.
// It differs from the engine in being slow and plain: nothing is shared between the views that could hide a
// slip in both, and each rule stands as one loop over plain lists. Tests lay random families out with both
// and compare every byte.

#include <support/plain/PlainLayout.h>

#include <array>
#include <bit>
#include <charconv>
#include <cstdint>
#include <exception>
#include <memory>

#include <support/plain/PlainFamily.h>
#include <support/plain/PlainPedigree.h>

namespace plain {

namespace {

std::string cutText(float value) {
    return std::to_string(cut(static_cast<double>(value)));
}

// Written piece by piece, so that a failure leaves what was there before it.
void writeRecord(Person& person, const Data& data, std::string& text) {
    const std::string idText = data.textOf(person.key);
    text += idText + ":" + cutText(person.corner.x) + ":" + cutText(person.corner.y) + ":";
    text += person.flagged ? "1:" : "0:";
    for (const Segment& segment : person.segments) {
        text += cutText(segment.x1) + "," + cutText(segment.y1) + ",";
        text += cutText(segment.x2) + "," + cutText(segment.y2) + "|";
    }
    if (idOf(idText) < 0) {
        text += ":";
        text += data.synthetic(idText).male ? "M" : "F";
        text += ":";
        text += data.synthetic(idText).childText;
    }
    text += ";";
}

// The bits of the float in hexadecimal; both zeros are written as the positive one.
std::string bitsText(float value) {
    const float written = value == 0.0F ? 0.0F : value;
    std::array<char, 8> digits{};
    digits.fill('0');
    std::uint32_t bits = std::bit_cast<std::uint32_t>(written);
    for (std::size_t i = digits.size(); i > 0; --i) {
        digits[i - 1] = "0123456789abcdef"[bits & 0xfU];
        bits >>= 4U;
    }
    return std::string(digits.data(), digits.size());
}

std::string coordinatesText(const Segment& segment) {
    return " " + bitsText(segment.x1) + " " + bitsText(segment.y1) + " " + bitsText(segment.x2) + " " +
           bitsText(segment.y2);
}

std::string pointsText(const Line& line) {
    std::string text = " " + std::to_string(line.points.size());
    for (const Point& point : line.points) text += " " + bitsText(point.x) + " " + bitsText(point.y);
    return text;
}

void describeEdges(const Person& person, std::vector<std::string>& lines) {
    for (const auto& [key, edge] : person.ownedEdges) {
        lines.push_back("E " + std::to_string(edge->person->key) + " " + std::to_string(edge->spouse->key) +
                        pointsText(edge->line));
        for (const GenerationEdge& child : edge->childEdges) {
            lines.push_back("C " + std::to_string(child.child->key) + pointsText(child.line));
        }
    }
    for (const GenerationEdge& edge : person.generationEdges) {
        lines.push_back("G " + std::to_string(edge.child->key) + " " +
                        std::to_string(edge.singleParent->key) + pointsText(edge.line));
    }
}

void describePerson(const Person& person, const Data& data, std::vector<std::string>& lines) {
    lines.push_back("P " + std::to_string(person.key) + " " + data.textOf(person.key) +
                    (person.male ? " 1 " : " 0 ") + bitsText(person.corner.x) + " " +
                    bitsText(person.corner.y) + (person.flagged ? " 1 " : " 0 ") +
                    std::to_string(person.parentKey));
    for (const Segment& segment : person.segments) {
        lines.push_back("S" + coordinatesText(segment) + (segment.isSpouseLine ? " 1" : " 0"));
    }
    for (const auto& [key, list] : person.spouseLines) {
        for (const Segment& segment : list) {
            lines.push_back("L " + std::to_string(key) + coordinatesText(segment));
        }
    }
    describeEdges(person, lines);
}

std::unique_ptr<Layouter> makeLayouter(Data& data, const support::CaseFile& request) {
    const int focusKey = data.keyOf(std::to_string(cutId(request.focus)));
    const bool male = data.isMale(focusKey);
    if (request.view == support::CaseView::pedigree) {
        return std::make_unique<PedigreeLayouter>(data, request, focusKey, male);
    }
    return std::make_unique<FamilyLayouter>(data, request, focusKey, male);
}

// What is in the text and the chart when a failure comes is what the caller keeps. The chart is described
// only once it is finished.
void run(Data& data, const support::CaseFile& request, bool graph, std::string& text,
         std::vector<std::string>& chart) {
    try {
        const std::unique_ptr<Layouter> layouter = makeLayouter(data, request);
        layouter->layOut();
        if (graph) layouter->walk([&](Person& person) { describePerson(person, data, chart); });
        layouter->walk([&](Person& person) { writeRecord(person, data, text); });
    } catch (const std::exception&) {
        return;
    }
}

}  // namespace

std::string Answer::text() const {
    std::string whole;
    for (const std::string& line : lines) whole += line + "\n";
    return whole;
}

Answer layOut(const support::CaseFile& request, bool graph, bool trace) {
    support::CaseHost host(request, trace);
    Data data(host, request.adapter);
    std::string text;
    std::vector<std::string> chart;
    run(data, request, graph, text, chart);

    Answer answer;
    answer.lines.push_back("text " + text);
    answer.lines.insert(answer.lines.end(), chart.begin(), chart.end());
    answer.lines.insert(answer.lines.end(), host.trace().begin(), host.trace().end());
    return answer;
}

}  // namespace plain
