// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

#include <cli/PdfUserUnit.h>

#include <charconv>
#include <cstddef>
#include <cstdio>
#include <stdexcept>
#include <string_view>
#include <vector>

namespace olvane::cli {

namespace {

struct PageObject {
    std::size_t number = 0;
    std::string text;  // without its "N 0 obj"
};

[[noreturn]] void refuse() {
    throw std::runtime_error("the picture could not be rendered: a PDF of an unknown form");
}

std::size_t find(std::string_view pdf, std::string_view what, std::size_t from = 0) {
    const std::size_t at = pdf.find(what, from);
    if (at == std::string_view::npos) refuse();
    return at;
}

std::size_t numberAt(std::string_view pdf, std::size_t at) {
    while (at < pdf.size() && (pdf[at] == ' ' || pdf[at] == '\n')) ++at;
    std::size_t number = 0;
    const auto [end, error] = std::from_chars(pdf.data() + at, pdf.data() + pdf.size(), number);
    if (error != std::errc()) refuse();
    return number;
}

// Behind the last "startxref".
std::size_t tableOf(std::string_view pdf) {
    const std::size_t at = pdf.rfind("startxref");
    if (at == std::string_view::npos) refuse();
    const std::size_t table = numberAt(pdf, at + 9);
    if (table >= pdf.size() || !pdf.substr(table).starts_with("xref\n0 ")) refuse();
    return table;
}

bool isPage(std::string_view object) {
    constexpr std::string_view kType = "<< /Type /Page";
    const std::size_t start = object.find(kType);
    constexpr std::size_t kMostBefore = 24;  // "N 0 obj"
    return start < kMostBefore && object.size() > start + kType.size() && object[start + kType.size()] != 's';
}

// By the table: "xref", "0 COUNT", then twenty bytes for each object.
std::vector<PageObject> pagesOf(std::string_view pdf) {
    constexpr std::size_t kEntry = 20;
    const std::size_t table = tableOf(pdf);
    const std::size_t count = numberAt(pdf, table + 7);
    const std::size_t first = find(pdf, "\n", table + 7) + 1;
    std::vector<PageObject> pages;
    for (std::size_t i = 1; i < count && first + (i + 1) * kEntry <= pdf.size(); ++i) {
        const std::size_t offset = numberAt(pdf, first + i * kEntry);
        if (offset >= pdf.size() || !isPage(pdf.substr(offset, 64))) continue;
        const std::size_t start = find(pdf, "<<", offset);
        pages.push_back({i, std::string(pdf.substr(start, find(pdf, "endobj", start) - start))});
    }
    return pages;
}

}  // namespace

std::string withUserUnit(std::string pdf, int unit) {
    const std::size_t table = tableOf(pdf);
    const std::size_t trailer = find(pdf, "<<", find(pdf, "trailer", table));
    const std::string dictionary = pdf.substr(trailer, find(pdf, ">>", trailer) - trailer);
    const std::vector<PageObject> pages = pagesOf(pdf);
    std::string entries;
    for (const PageObject& page : pages) {
        char entry[64];
        std::snprintf(entry, sizeof entry, "%zu 1\n%010zu 00000 n \n", page.number, pdf.size());
        entries += entry;
        pdf += std::to_string(page.number) + " 0 obj\n<< /UserUnit " + std::to_string(unit) +
               page.text.substr(2) + "endobj\n";
    }
    const std::size_t update = pdf.size();
    pdf += "xref\n" + entries + "trailer\n" + dictionary + "   /Prev " + std::to_string(table) +
           "\n>>\nstartxref\n" + std::to_string(update) + "\n%%EOF\n";
    if (pdf.starts_with("%PDF-1.") && pdf[7] < '6') pdf[7] = '6';
    return pdf;
}

}  // namespace olvane::cli
