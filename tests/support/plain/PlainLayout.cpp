// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One request to the plain layout: the frame around a view, the result text, and the finished chart as lines.
// It differs from the engine in being slow and plain: nothing is shared between the views that could hide a
// slip in both, and each rule stands as one loop over plain lists. Tests lay random families out with both
// and compare every byte.

#include <support/plain/PlainLayout.h>

#include <array>
#include <bit>
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
    text += idText;
    text += ':';
    text += cutText(person.corner.x);
    text += ':';
    text += cutText(person.corner.y);
    text += person.flagged ? ":1:" : ":0:";
    for (const Segment& segment : person.segments) {
        text += cutText(segment.x1);
        text += ',';
        text += cutText(segment.y1);
        text += ',';
        text += cutText(segment.x2);
        text += ',';
        text += cutText(segment.y2);
        text += '|';
    }
    if (idOf(idText) < 0) {
        text += ":";
        text += data.unknownParent(idText).male ? "M" : "F";
        text += ":";
        text += data.unknownParent(idText).childText;
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

using Words = std::vector<std::string>;

std::string lineOf(const Words& words) {
    std::string line;
    for (const std::string& word : words) {
        if (!line.empty()) line += ' ';
        line += word;
    }
    return line;
}

void addCoordinates(const Segment& segment, Words& words) {
    for (const float value : {segment.x1, segment.y1, segment.x2, segment.y2}) {
        words.push_back(bitsText(value));
    }
}

void addPoints(const Line& line, Words& words) {
    words.push_back(std::to_string(line.points.size()));
    for (const Point& point : line.points) {
        words.push_back(bitsText(point.x));
        words.push_back(bitsText(point.y));
    }
}

std::string flagText(bool flag) {
    return flag ? "1" : "0";
}

std::string personLine(const Person& person, const Data& data) {
    return lineOf({"P", std::to_string(person.key), data.textOf(person.key), flagText(person.male),
                   bitsText(person.corner.x), bitsText(person.corner.y), flagText(person.flagged),
                   std::to_string(person.parentKey)});
}

std::string segmentLine(const Segment& segment) {
    Words words = {"S"};
    addCoordinates(segment, words);
    words.push_back(flagText(segment.isSpouseLine));
    return lineOf(words);
}

std::string spouseLineLine(int key, const Segment& segment) {
    Words words = {"L", std::to_string(key)};
    addCoordinates(segment, words);
    return lineOf(words);
}

std::string edgeLine(Words words, const Line& line) {
    addPoints(line, words);
    return lineOf(words);
}

void describeEdges(const Person& person, std::vector<std::string>& lines) {
    for (const auto& [key, edge] : person.ownedEdges) {
        const std::string first = std::to_string(edge->person->key);
        const std::string second = std::to_string(edge->spouse->key);
        lines.push_back(edgeLine({"E", first, second}, edge->line));
        for (const GenerationEdge& child : edge->childEdges) {
            lines.push_back(edgeLine({"C", std::to_string(child.child->key)}, child.line));
        }
    }
    for (const GenerationEdge& edge : person.generationEdges) {
        const std::string child = std::to_string(edge.child->key);
        const std::string parent = std::to_string(edge.singleParent->key);
        lines.push_back(edgeLine({"G", child, parent}, edge.line));
    }
}

void describePerson(const Person& person, const Data& data, std::vector<std::string>& lines) {
    lines.push_back(personLine(person, data));
    for (const Segment& segment : person.segments) lines.push_back(segmentLine(segment));
    for (const auto& [key, list] : person.spouseLines) {
        for (const Segment& segment : list) lines.push_back(spouseLineLine(key, segment));
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
    for (const std::string& line : lines) {
        whole += line;
        whole += '\n';
    }
    return whole;
}

Answer layOut(const support::CaseFile& request, bool graph, bool trace) {
    support::CaseHost host(support::borrowed(request), trace);
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
