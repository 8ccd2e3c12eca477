#pragma once

#include <string>
#include <string_view>

/// Escaping of texts for XML attributes and HTML, and back. All are linear in the text.
///
/// Both encoders keep plain letters, digits and most punctuation, and the letters of an ANSI code page whose
/// value there isn't their code point. Everything else is written as `&#n;` with the code point, so that
/// every reader of HTML shows it. An entity that already stands in the text isn't encoded again.
namespace tovimar {

/// For settings and catalogue. `vfCyrillicAsEntity` writes Russian letters as numbers too. Entities are
/// copied as they are.
std::string EncodeSpecialChars(const std::string& text, bool vfCyrillicAsEntity = false);

/// For definitions and topics. Named entities become their numeric form; ";" stays.
std::string EncodeXmlText(const std::string& text, bool rfCyrillicAsEntity = false);

/// `EncodeXmlText` for a name, which means itself: an "&" in it begins no entity, so that a name such as
/// "R&amp;D" reads back as it was.
std::string EncodeXmlName(const std::string& name);
/// `EncodeSpecialChars` for a name.
std::string EncodeSpecialName(const std::string& name);
/// The same two behind a text that is being built, for writers of many values.
void AppendSpecialChars(std::string& out, std::string_view text);
void AppendSpecialName(std::string& out, std::string_view name);

/// Entities become characters: first every "&amp;", then all named ones, then the numeric ones. Names are
/// looked up as written, then without regard to case. Numbers 128 to 159 are taken from the ANSI code page.
std::string DecodeHtmlEntities(const std::string& text);
/// The same, for captions read back from topics.
std::string DecodeEntities(const std::string& text);

} // namespace tovimar
