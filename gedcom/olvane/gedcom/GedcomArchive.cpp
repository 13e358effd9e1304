// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// GEDCOM in a zip archive (.gdz): the standard puts the text into a member named gedcom.ged, beside the media
// files.

#include <olvane/gedcom/GedcomArchiveInternal.h>

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>

#include <zip.h>

#include <olvane/gedcom/GedcomError.h>
#include <olvane/gedcom/GedcomMedia.h>

namespace olvane::gedcom {
namespace {

constexpr const char* kMember = "gedcom.ged";
// Text packs about ten to one. An archive that claims far more is made to fill the memory.
constexpr std::size_t kHighestRatio = 100;
constexpr std::size_t kAlwaysAllowedBytes = 64U * 1024 * 1024;

struct DiscardArchive {
    void operator()(zip_t* archive) const { zip_discard(archive); }
};
struct CloseMember {
    void operator()(zip_file_t* member) const { zip_fclose(member); }
};
using Archive = std::unique_ptr<zip_t, DiscardArchive>;
using Member = std::unique_ptr<zip_file_t, CloseMember>;

Archive openArchive(const std::string& bytes, const std::string& name) {
    zip_error_t error;
    zip_error_init(&error);
    zip_source_t* source = zip_source_buffer_create(bytes.data(), bytes.size(), 0, &error);
    zip_t* archive = source == nullptr ? nullptr : zip_open_from_source(source, ZIP_RDONLY, &error);
    if (archive == nullptr && source != nullptr) zip_source_free(source);
    const std::string reason = zip_error_strerror(&error);
    zip_error_fini(&error);
    if (archive == nullptr) throw GedcomError(name, "is an archive that cannot be opened: " + reason);
    return Archive(archive);
}

bool endsWithGed(std::string_view member) {
    if (member.size() < 4) return false;
    std::string ending(member.substr(member.size() - 4));
    std::transform(ending.begin(), ending.end(), ending.begin(),
                   [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; });
    return ending == ".ged";
}

// The member of the standard's name, else the first that ends like one.
zip_uint64_t findMember(zip_t* archive, const std::string& name, DiagnosticList& diagnostics) {
    const zip_int64_t standard = zip_name_locate(archive, kMember, ZIP_FL_ENC_GUESS);
    if (standard >= 0) return static_cast<zip_uint64_t>(standard);
    const zip_int64_t count = zip_get_num_entries(archive, 0);
    for (zip_int64_t at = 0; at < count; ++at) {
        const char* member = zip_get_name(archive, static_cast<zip_uint64_t>(at), ZIP_FL_ENC_GUESS);
        if (member == nullptr || !endsWithGed(member)) continue;
        diagnostics.add(DiagnosticKind::archiveMember, Severity::warning, 0,
                        DiagnosticSentence::archiveWithoutGedcomFile, DiagnosticSentence::otherMemberRead,
                        member);
        return static_cast<zip_uint64_t>(at);
    }
    throw GedcomError(name, "is an archive without a GEDCOM file in it");
}

}  // namespace

bool looksLikeArchive(std::string_view bytes) {
    return bytes.starts_with("PK\x03\x04");
}

std::string unpackGedcom(const std::string& bytes, const std::string& name, DiagnosticList& diagnostics) {
    const Archive archive = openArchive(bytes, name);
    const zip_uint64_t place = findMember(archive.get(), name, diagnostics);
    const Member member(zip_fopen_index(archive.get(), place, 0));
    if (member == nullptr) throw GedcomError(name, "holds a member that cannot be unpacked");
    const std::size_t limit = std::max(kAlwaysAllowedBytes, bytes.size() * kHighestRatio);
    std::string text;
    std::array<char, 64 * 1024> block;
    for (;;) {
        const zip_int64_t got = zip_fread(member.get(), block.data(), block.size());
        if (got < 0) throw GedcomError(name, "holds a member that is damaged");
        if (got == 0) break;
        text.append(block.data(), static_cast<std::size_t>(got));
        if (text.size() > limit) throw GedcomError(name, "unpacks to more than such an archive may hold");
    }
    if (text.empty()) throw GedcomError(name, "holds a GEDCOM file that is empty");
    return text;
}

std::optional<std::string> readFromArchive(const std::string& archive, const std::string& archiveName,
                                           std::string_view file, std::size_t mostBytes) {
    const auto name = memberOfArchive(file);
    const Archive opened = openArchive(archive, archiveName);
    const zip_int64_t place = name ? zip_name_locate(opened.get(), name->c_str(), ZIP_FL_ENC_GUESS) : -1;
    if (place < 0) return {};
    const Member member(zip_fopen_index(opened.get(), static_cast<zip_uint64_t>(place), 0));
    if (member == nullptr) throw GedcomError(archiveName, "holds a member that cannot be unpacked");
    std::string bytes;
    std::array<char, 64 * 1024> block;
    for (;;) {
        const zip_int64_t got = zip_fread(member.get(), block.data(), block.size());
        if (got < 0) throw GedcomError(archiveName, "holds a member that is damaged");
        if (got == 0) return bytes;
        if (static_cast<std::size_t>(got) > mostBytes - bytes.size()) return {};
        bytes.append(block.data(), static_cast<std::size_t>(got));
    }
}

}  // namespace olvane::gedcom
