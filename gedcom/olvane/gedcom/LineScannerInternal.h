// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

#include <olvane/gedcom/DiagnosticListInternal.h>

namespace olvane::gedcom {

// Without spaces and tabs on either side.
std::string_view trimmed(std::string_view text);

// Where the text of a CONC line begins, if rest starts with a line end and such a line; else npos.
std::size_t findConcText(std::string_view rest);

// A line taken apart. Views into the scanned bytes, in the encoding of the file.
struct GedcomLine {
    static constexpr std::size_t kDeep = 8;

    std::size_t level =
        0;  // how deep the line lies, whatever number it has; kDeep stands for that and beyond
    std::string_view xref;  // between its @
    std::string_view tag;
    std::string_view value;    // behind one delimiter; spaces kept
    std::uint32_t number = 0;  // of the line, from 1
};

// Cuts bytes into lines at LF, CR and CRLF, in any mixture; also at LFCR and CRCRLF, which are what careless conversions
// leave, as at one line end.
//
// Holds: time is linear however far apart the line ends of either sort are.
class LineCutter {
public:
    explicit LineCutter(std::string_view bytes);

    bool next(std::string_view& text);
    std::uint32_t number() const { return number_; }
    std::string_view rest() const { return bytes_.substr(at_); }
    // How much of the bytes lies behind, from 0 to 1.
    double share() const { return static_cast<double>(at_) / static_cast<double>(bytes_.size()); }

private:
    void skipEnd();
    bool standsAt(char wanted, std::size_t ahead) const {
        return at_ + ahead < bytes_.size() && bytes_[at_ + ahead] == wanted;
    }

    std::string_view bytes_;
    bool endsInLfCr_ = false;  // the first line does
    std::size_t at_ = 0;
    std::uint32_t number_ = 0;
    // Where the next one is, at or behind at_ once a line was asked for; the size of the bytes if there is none.
    std::size_t nextLf_;
    std::size_t nextCr_;
};

// Walks over the lines of a GEDCOM text, in an encoding that has ASCII in it. What is no line is reported and
// passed over; the depth of a line follows from the lines before it, so that a wrong number does not tear a
// record apart.
//
// Lifetime: the bytes outlive the scanner and its lines.
class LineScanner {
public:
    LineScanner(std::string_view bytes, DiagnosticList& diagnostics);

    // False at the end.
    bool next(GedcomLine& line);

    // The value with the CONC and CONT lines that follow it: a view of the value itself if there are none,
    // else of a text that stays until the next call. To be asked for the line that was read last.
    std::string_view wholeValue(const GedcomLine& line);

    std::uint32_t lineNumber() const { return cutter_.number(); }
    std::size_t bytesLeft() const { return cutter_.rest().size(); }
    // How much of the text is read, from 0 to 1.
    double share() const { return cutter_.share(); }

private:
    bool parse(std::string_view text, GedcomLine& line);
    bool takeLevel(std::string_view& rest, GedcomLine& line);
    bool takeUnusualLevel(std::string_view& rest, GedcomLine& line);
    bool takeXref(std::string_view& rest, GedcomLine& line);
    bool takeTagAndValue(std::string_view rest, GedcomLine& line);
    void settleDepth(GedcomLine& line);
    bool refuse(std::string_view text, const GedcomLine& line);

    LineCutter cutter_;
    DiagnosticList& diagnostics_;
    std::string joined_;
    std::uint32_t writtenLevel_ = 0;   // of the line in hand
    std::string_view levelDigits_;     // the same as written
    std::uint32_t previousLevel_ = 0;  // as written
    // Written levels of the lines that the next one may lie under, from the record down. Rises strictly.
    std::array<std::uint32_t, GedcomLine::kDeep> ancestors_{};
    std::size_t ancestorCount_ = 1;
};

}  // namespace olvane::gedcom
