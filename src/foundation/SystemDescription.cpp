#include "foundation/ErrorTrap.h"
#include "foundation/Product.h"
#include "foundation/Session.h"
#include "platform/Environment.h"
#include "platform/text/Text.h"

#include <langinfo.h>
#include <locale.h>
#include <sys/utsname.h>
#include <unicode/locid.h>
#include <unicode/uloc.h>
#include <unicode/ulocdata.h>
#include <unicode/unistr.h>

/// The text that goes with a failure: what the host has open, the machine and its locale.
namespace tovimar {
namespace {

std::string Utf8(const icu::UnicodeString& text) {
    std::string out;
    return text.toUTF8String(out);
}

std::string Line(const char* label, const std::string& value) {
    return "  " + std::string(label) + value + "\r\n";
}

icu::Locale LocaleInForce() {
    char name[64] = "en_US";
    UErrorCode status = U_ZERO_ERROR;
    uloc_getLocaleForLCID(static_cast<std::uint32_t>(platform::Env().languageId), name, sizeof name, &status);
    return icu::Locale(U_SUCCESS(status) ? name : "en_US");
}

std::string HostBlock() {
    return "[Current MS Access Status Info]\r\n" +
           Line("Source project: ", Session::Context().CurrentSourceProjectFullPath());
}

std::string SystemBlock() {
    utsname system{};
    uname(&system);
    return "[System Information]\r\n" +
           Line("Operating System: ",
                std::string(system.sysname) + " " + system.release + " " + system.machine) +
           Line("Add-In: ", TitleAndVersion());
}

std::string LocaleBlock() {
    const icu::Locale locale = LocaleInForce();
    const auto english = icu::Locale::getEnglish();
    icu::UnicodeString name;
    const std::string languageId = std::to_string(platform::Env().languageId);
    UErrorCode status = U_ZERO_ERROR;
    const bool metric = ulocdata_getMeasurementSystem(locale.getName(), &status) != UMS_US;
    std::string out = "[Locale information]\r\n";
    out += Line("English name of language: ", Utf8(locale.getDisplayLanguage(english, name)));
    out += Line("Native name of language: ", Utf8(locale.getDisplayLanguage(locale, name)));
    out += Line("Country code: ", locale.getCountry());
    out += Line("English name of country: ", Utf8(locale.getDisplayCountry(english, name)));
    out += Line("Native name of country: ", Utf8(locale.getDisplayCountry(locale, name)));
    out += Line("Default language id: ", languageId);
    out += Line("Default country code: ", locale.getCountry());
    out += Line("Default code page: ", std::to_string(text::AnsiCodePage().Number()));
    out += Line("List item separator: ", metric ? ";" : ",");
    out += Line("Measure system: ", metric ? "Metric" : "US");
    out += Line("Decimal separator: ", localeconv()->decimal_point);
    out += Line("Thousand separator: ", localeconv()->thousands_sep);
    return out;
}

} // namespace

std::string SystemDescription() {
    return HostBlock() + "\r\n" + SystemBlock() + "\r\n" + LocaleBlock();
}

} // namespace tovimar
