// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family as a block of data in a page: JSON in a script element of a type that no browser runs, with the GEDCOM
// text compressed.

#include <cli/PageFamily.h>

#include <cstddef>
#include <stdexcept>

#include <zlib.h>
#include <boost/archive/iterators/base64_from_binary.hpp>
#include <boost/archive/iterators/transform_width.hpp>
#include <nlohmann/json.hpp>

namespace olvane::cli {

namespace {

constexpr std::string_view kPlaceOfFamily = "<!-- olvane:family -->";
constexpr std::string_view kPlaceOfMap = "<!-- olvane:map -->";
constexpr std::string_view kPlaceOfTitle = "<title>Olvane</title>";

// The header says nothing of time or system, so equal texts give equal bytes.
std::string gzipped(const std::string& text, int level) {
    constexpr int kGzipWindow = 15 + 16;
    constexpr int kMemoryLevel = 8;
    z_stream stream{};
    if (deflateInit2(&stream, level, Z_DEFLATED, kGzipWindow, kMemoryLevel, Z_DEFAULT_STRATEGY) != Z_OK) {
        throw std::runtime_error("the family could not be compressed");
    }
    std::string packed(deflateBound(&stream, text.size()), '\0');
    stream.next_in = reinterpret_cast<Bytef*>(const_cast<char*>(text.data()));  // zlib reads alone
    stream.avail_in = static_cast<uInt>(text.size());
    stream.next_out = reinterpret_cast<Bytef*>(packed.data());
    stream.avail_out = static_cast<uInt>(packed.size());
    const int end = deflate(&stream, Z_FINISH);
    packed.resize(stream.total_out);
    deflateEnd(&stream);
    if (end != Z_STREAM_END) throw std::runtime_error("the family could not be compressed");
    return packed;
}

std::string base64(const std::string& bytes) {
    using namespace boost::archive::iterators;
    using Sextets = base64_from_binary<transform_width<std::string::const_iterator, 6, 8>>;
    std::string text(Sextets(bytes.begin()), Sextets(bytes.end()));
    return text.append((3 - bytes.size() % 3) % 3, '=');
}

std::string replacedAll(std::string text, std::string_view what, std::string_view by) {
    for (std::size_t at = text.find(what); at != std::string::npos; at = text.find(what, at + by.size())) {
        text.replace(at, what.size(), by);
    }
    return text;
}

std::string asMarkup(std::string text) {
    return replacedAll(replacedAll(std::move(text), "&", "&amp;"), "<", "&lt;");
}

nlohmann::ordered_json phraseJson(const gedcom::DiagnosticPhrase& phrase) {
    return {{"sentence", gedcom::sentenceName(phrase.sentence)}, {"arguments", phrase.arguments}};
}

// Without words: the page has those of its reader's language.
nlohmann::ordered_json remarksOf(const PageFamily& family) {
    nlohmann::ordered_json remarks = nlohmann::ordered_json::array();
    for (const gedcom::Diagnostic& remark : family.remarks) {
        nlohmann::ordered_json done = nlohmann::ordered_json::array();
        for (const gedcom::DiagnosticPhrase& phrase : remark.done) done.push_back(phraseJson(phrase));
        remarks.push_back({{"line", remark.line},
                           {"severity", gedcom::severityName(remark.severity)},
                           {"kind", gedcom::kindName(remark.kind)},
                           {"what", phraseJson(remark.what)},
                           {"done", std::move(done)},
                           {"quoted", remark.quoted}});
    }
    return remarks;
}

// By the name that the text has for the file.
nlohmann::ordered_json photosOf(const PageFamily& family) {
    nlohmann::ordered_json photos = nlohmann::ordered_json::object();
    for (const PagePhoto& photo : family.photos) photos[photo.file] = base64(photo.jpeg);
    return photos;
}

// Nothing in it can end the element.
std::string familyBlock(const PageFamily& family) {
    const nlohmann::ordered_json json = {
        {"name", family.name},
        {"title", family.title},
        {"focus", family.focus},
        {"address", family.address},
        {"livingHidden", family.livingHidden},
        {"remarks", remarksOf(family)},
        {"photos", photosOf(family)},
        {"map", !family.map.empty()},
        {"gzip", family.gedcom.empty() ? "" : base64(gzipped(family.gedcom, Z_BEST_COMPRESSION))},
    };
    const std::string text = json.dump(-1, ' ', false, nlohmann::ordered_json::error_handler_t::replace);
    return "<script type=\"application/json\" id=\"olvane-family\">" + replacedAll(text, "<", "\\u003c") +
           "</script>";
}

// At the page's end: in a page that was cut short all else is still there. The best compression
// takes ten times as long, for a hundredth of the size.
std::string mapBlock(const PageFamily& family) {
    return "<script type=\"application/octet-stream\" id=\"olvane-map\">" +
           base64(gzipped(family.map, Z_DEFAULT_COMPRESSION)) + "</script>";
}

void fillPlace(std::string& page, std::string_view place, const std::string& content) {
    const std::size_t at = page.find(place);
    if (at == std::string::npos) {
        throw std::logic_error("the page has no place for " + std::string(place));
    }
    page.replace(at, place.size(), content);
}

}  // namespace

std::string pageWith(std::string_view pageTemplate, const PageFamily& family) {
    std::string page(pageTemplate);
    fillPlace(page, kPlaceOfTitle, "<title>" + asMarkup(family.title) + "</title>");
    fillPlace(page, kPlaceOfFamily, familyBlock(family));
    if (!family.map.empty()) fillPlace(page, kPlaceOfMap, mapBlock(family));
    return page;
}

}  // namespace olvane::cli
