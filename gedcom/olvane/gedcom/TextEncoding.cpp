// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which encoding a file is in, and its text in Unicode. Headers lie: files that call themselves ANSEL or ANSI
// are often UTF-8, and those that say UTF-8 were often written by a program that only knew its system's code
// page. UTF-8 can hardly be met by chance, so bytes that are UTF-8 are taken as such; ANSEL is distinguished from a
// code page by whether its marks stand before letters that can bear them. The text stays as it is in the file
// until a value is kept, because a character may be cut in two by a CONC line.

#include <olvane/gedcom/TextEncodingInternal.h>

#include <algorithm>
#include <cstddef>
#include <utility>

#include <olvane/gedcom/AnselInternal.h>
#include <olvane/gedcom/EncodingGuessInternal.h>
#include <olvane/gedcom/GedcomError.h>
#include <olvane/gedcom/LineScannerInternal.h>
#include <olvane/gedcom/MultiByteTextInternal.h>
#include <olvane/gedcom/PlatformDecoderInternal.h>
#include <olvane/gedcom/UnicodeTextInternal.h>
#include <olvane/gedcom/Utf16TextInternal.h>

namespace olvane::gedcom {
namespace {

constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";

bool isUtf16(const KnownEncoding* encoding) {
    return encoding == &kUtf16Little || encoding == &kUtf16Big;
}

bool hasPage(const KnownEncoding* encoding) {
    return encoding->sort == EncodingSort::ownPage || encoding->sort == EncodingSort::platformPage;
}

// Takes the bytes for UTF-16 of that order, and makes them UTF-8.
const KnownEncoding* turnUtf16(std::string& bytes, Utf16Order order, DiagnosticList& diagnostics) {
    if (bytes.size() % 2 != 0) {
        diagnostics.add(DiagnosticKind::badCharacter, Severity::error, 0, DiagnosticSentence::halfCharacter,
                        DiagnosticSentence::leftOut);
    }
    bytes = utf8FromUtf16(bytes, order);
    return order == Utf16Order::bigEndian ? &kUtf16Big : &kUtf16Little;
}

bool takeUtf8Mark(std::string& bytes) {
    if (!bytes.starts_with(kUtf8Mark)) return false;
    bytes.erase(0, kUtf8Mark.size());
    return true;
}

// Reads the header record alone; nothing is reported, since all lines are read again.
HeaderClaims readHeaderClaims(std::string_view bytes) {
    DiagnosticList unheard({}, 0);
    LineScanner scanner(bytes, unheard);
    HeaderClaims claims;
    GedcomLine line;
    std::string_view section;
    if (!scanner.next(line) || line.level != 0 || line.tag != "HEAD") return claims;
    while (scanner.next(line) && line.level != 0) {
        if (line.level == 1) section = line.tag;
        if (line.level == 1 && line.tag == "CHAR" && claims.charactersLine == 0) {
            claims.characters = trimmed(line.value);
            claims.charactersLine = line.number;
        }
        if (line.level == 2 && section == "GEDC" && line.tag == "VERS" && claims.version.empty()) {
            claims.version = trimmed(line.value);
        }
    }
    return claims;
}

// A file's version counts as 7 or later by its first number.
bool isBeforeVersion7(std::string_view version) {
    const std::string_view major = version.substr(0, version.find('.'));
    return major.empty() || major.size() > 1 || major[0] < '7' || major[0] > '9';
}

// All that the header says fits a text of ASCII alone, but for UTF-16. Since version 7 there is UTF-8 only.
const KnownEncoding* encodingOfAscii(const HeaderClaims& claims, const KnownEncoding* claimed) {
    if (claimed != nullptr && !isUtf16(claimed)) return claimed;
    return isBeforeVersion7(claims.version) ? &kAscii : &kUtf8;
}

// Marks before letters that have none in Unicode are rare, and so are bytes that are no ANSEL at all; those are
// usual in text of another encoding, whose letters end words.
bool isAnsel(std::string_view bytes, bool claimed) {
    constexpr std::size_t kWeightOfFaults = 4;
    const AnselCensus ansel = takeAnselCensus(bytes);
    const std::size_t against = ansel.doubtful + kWeightOfFaults * ansel.impossible;
    return claimed ? against == 0 || ansel.fitting > against : against == 0;
}

// What the bytes beyond ASCII allow, for a file that is neither UTF-16 nor marked as UTF-8.
const KnownEncoding* encodingByBytes(std::string_view bytes, const KnownEncoding* claimed,
                                     const Utf8Census& census) {
    constexpr std::size_t kCharactersPerFault = 8;
    if (census.characters > census.faults * kCharactersPerFault) return &kUtf8;
    if (claimed == &kUtf8 && census.characters >= census.faults) return &kUtf8;
    if (claimed != nullptr && (hasPage(claimed) || claimed->sort == EncodingSort::multiByte)) return claimed;
    if (claimed != nullptr && claimed != &kAnsel) return &kWindowsLatin;
    return isAnsel(bytes, claimed == &kAnsel) ? &kAnsel : &kWindowsLatin;
}

class EncodingChooser {
public:
    EncodingChooser(std::string_view bytes, const HeaderClaims& claims, DiagnosticList& diagnostics)
        : bytes_(bytes),
          claims_(claims),
          claimed_(findEncoding(claims.characters)),
          census_(takeUtf8Census(bytes)),
          diagnostics_(diagnostics) {}

    const KnownEncoding* choose(bool marked) {
        const bool ascii = census_.characters == 0 && census_.faults == 0;
        const KnownEncoding* used = &kUtf8;
        if (!marked)
            used = ascii ? encodingOfAscii(claims_, claimed_) : encodingByBytes(bytes_, claimed_, census_);
        reportClaims(used, ascii);
        reportFaults(used);
        return used;
    }

    const KnownEncoding* takeUtf16(const KnownEncoding* order) {
        reportClaims(order, true);
        return order;
    }

private:
    // Certain is what cannot be met by chance: UTF-8, UTF-16, and text of ASCII alone.
    void reportClaims(const KnownEncoding* used, bool ascii) {
        const bool certain = ascii || used == &kUtf8 || isUtf16(used);
        const DiagnosticPhrase done{DiagnosticSentence::asEncoding, {std::string(used->name)}};
        if (claims_.characters.empty()) {
            if (!certain)
                addGuess(DiagnosticKind::encodingUnknown, Severity::warning, DiagnosticSentence::noneNamed,
                         done);
        } else if (claimed_ == nullptr) {
            constexpr DiagnosticSentence what = DiagnosticSentence::encodingNotKnown;
            if (certain) return add(DiagnosticKind::encodingUnknown, Severity::warning, what, done);
            addGuess(DiagnosticKind::encodingUnknown, Severity::error, what, done);
        } else if (claimed_ != used && !(isUtf16(claimed_) && isUtf16(used))) {
            constexpr DiagnosticSentence what = DiagnosticSentence::otherThanNamed;
            if (certain) return add(DiagnosticKind::encodingMismatch, Severity::warning, what, done);
            addGuess(DiagnosticKind::encodingMismatch, Severity::error, what, done);
        } else if (!certain && hasPage(used) && !explains(*used)) {
            addGuess(DiagnosticKind::encodingMismatch, Severity::error, DiagnosticSentence::unlikeNamed,
                     done);
        } else if (namesASystem(claims_.characters)) {
            add(DiagnosticKind::encodingUnknown, Severity::note, DiagnosticSentence::systemNamed, done);
        }
    }

    // Only windows-1252 is looked at for what else it may be: it is what programs claim by default.
    bool explains(const KnownEncoding& used) const { return &used != &kWindowsLatin || looksWestern(bytes_); }

    void add(DiagnosticKind kind, Severity severity, DiagnosticSentence what, const DiagnosticPhrase& done) {
        diagnostics_.add(kind, severity, claims_.charactersLine, what, done, claims_.characters);
    }
    void addGuess(DiagnosticKind kind, Severity severity, DiagnosticSentence what,
                  const DiagnosticPhrase& done) {
        diagnostics_.add(kind, severity, claims_.charactersLine, what, {done, encodingSuggestion(bytes_)},
                         claims_.characters);
    }

    void reportFaults(const KnownEncoding* used) {
        if (used != &kUtf8 || census_.faults == 0) return;
        diagnostics_.add(DiagnosticKind::badCharacter, Severity::warning, 0,
                         DiagnosticPhrase{DiagnosticSentence::faultsInUtf8, {std::to_string(census_.faults)}},
                         DiagnosticSentence::listedBelow);
    }

    std::string_view bytes_;
    const HeaderClaims& claims_;
    const KnownEncoding* claimed_;
    Utf8Census census_;
    DiagnosticList& diagnostics_;
};

// The platform decodes the bytes 80 to FF on lines of their own, so that none waits for the next one.
bool fillFromPlatform(const KnownEncoding& encoding, CodePage& page) {
    std::string bytes;
    for (unsigned byte = 0x80; byte <= 0xFF; ++byte) bytes.append({static_cast<char>(byte), '\n'});
    const auto text = decodedByPlatform(encoding, bytes);
    if (!text) return false;
    std::string_view rest = *text;
    for (char16_t& character : page) {
        const std::string_view line = rest.substr(0, rest.find('\n'));
        character = static_cast<char16_t>(firstCharacter(line));
        if (character == 0xFFFD) character = 0;
        rest.remove_prefix(std::min(line.size() + 1, rest.size()));
    }
    return true;
}

// How values are read, now that the encoding is known; false if the platform does not know it.
bool setCoding(std::string& bytes, TextForm& form, DiagnosticList& diagnostics) {
    const KnownEncoding& encoding = *form.encoding;
    switch (encoding.sort) {
        case EncodingSort::ansel:
            form.coding = ValueCoding::ansel;
            return true;
        case EncodingSort::ownPage:
            form.coding = ValueCoding::page;
            form.page = *encoding.page;
            return true;
        case EncodingSort::platformPage:
            form.coding = ValueCoding::page;
            return fillFromPlatform(encoding, form.page);
        case EncodingSort::multiByte:
            return isAscii(bytes) || turnMultiByte(bytes, encoding, diagnostics);
        default:
            return true;
    }
}

// A file that says by a mark or by zero bytes what it is cannot be read as anything else.
const KnownEncoding* takeUnicode(std::string& bytes, const KnownEncoding* chosen, bool& marked,
                                 DiagnosticList& diagnostics) {
    Utf16Order order = utf16OrderOf(bytes);
    if (order == Utf16Order::none && chosen == &kUtf16Little) order = Utf16Order::littleEndian;
    if (order == Utf16Order::none && chosen == &kUtf16Big) order = Utf16Order::bigEndian;
    if (order != Utf16Order::none) return turnUtf16(bytes, order, diagnostics);
    marked = takeUtf8Mark(bytes);
    return marked ? &kUtf8 : nullptr;
}

const KnownEncoding* chosenEncoding(std::string_view chosen, const std::string& file) {
    if (chosen.empty()) return nullptr;
    if (const KnownEncoding* found = findEncoding(chosen)) return found;
    throw GedcomError(
        file, "cannot be read as " + lossyUtf8(chosen) +
                  ", which is no known encoding; UTF-8, ANSEL, windows-1252, ISO-8859-2 and IBM850 are "
                  "some that are known");
}

void reportChosen(const KnownEncoding* chosen, const KnownEncoding* found, DiagnosticList& diagnostics) {
    if (found == nullptr || found == chosen || (isUtf16(chosen) && isUtf16(found))) return;
    diagnostics.add(
        DiagnosticKind::encodingMismatch, Severity::warning, 0, DiagnosticSentence::otherThanChosen,
        DiagnosticPhrase{DiagnosticSentence::asEncoding, {std::string(found->name)}}, chosen->name);
}

}  // namespace

TextForm prepareText(std::string& bytes, const std::string& file, std::string_view chosen,
                     DiagnosticList& diagnostics) {
    const KnownEncoding* const wanted = chosenEncoding(chosen, file);
    bool marked = false;
    const KnownEncoding* const found = takeUnicode(bytes, wanted, marked, diagnostics);
    const HeaderClaims claims = readHeaderClaims(bytes);
    TextForm form;
    form.version = lossyUtf8(claims.version);
    form.doublesEveryAt = isBeforeVersion7(claims.version);
    if (wanted != nullptr) {
        reportChosen(wanted, found, diagnostics);
        form.encoding = found != nullptr ? found : wanted;
    } else {
        EncodingChooser chooser(bytes, claims, diagnostics);
        form.encoding = isUtf16(found) ? chooser.takeUtf16(found) : chooser.choose(marked);
    }
    if (setCoding(bytes, form, diagnostics)) return form;
    throw GedcomError(file, std::string("is in ")
                                .append(form.encoding->name)
                                .append(", which this system cannot read; convert the file to UTF-8"));
}

}  // namespace olvane::gedcom
