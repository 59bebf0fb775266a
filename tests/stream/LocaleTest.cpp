#include "foundation/utl_Stream.h"

#include <gtest/gtest.h>

#include <clocale>
#include <locale>
#include <string>

namespace {

std::string SampleText() {
    qio_StringDevice device;
    {
        utl_Stream stream(device, 131, 6, 6);
        stream << 1234567 << "|" << 0.5 << "|" << 1234567.5f << "|";
        stream.Print(1234.5, 12, 15);
        stream.Print(1234.5, 12, 17);
        stream.Print(1234.5f, 12, 7);
    }
    return device.Text();
}

const char* const kSample = "1234567|0.5|1.23457e+06|      1234.5      1234.5      1234.5";

TEST(Locale, DecimalCommaOfTheCLibrary_ReachesNoDeck) {
    const std::string former = std::setlocale(LC_ALL, nullptr);
    const char* found = nullptr;
    for (const char* name :
         {"de_DE.UTF-8", "de_DE.utf8", "de_DE", "fr_FR.UTF-8", "fr_FR.utf8", "es_ES.UTF-8"}) {
        found = std::setlocale(LC_ALL, name);
        if (found != nullptr) break;
    }
    if (found == nullptr) GTEST_SKIP() << "no locale with a decimal comma is installed";
    EXPECT_STREQ(std::localeconv()->decimal_point, ",");
    const std::string text = SampleText();
    char fixed[16] = "        10";
    utl_Stream::FixNumericString(fixed, 10);
    std::setlocale(LC_ALL, former.c_str());
    EXPECT_EQ(text, kSample);
    EXPECT_STREQ(fixed, "       10.");
}

class CommaAndGroups : public std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
    char do_thousands_sep() const override { return '.'; }
    std::string do_grouping() const override { return "\3"; }
};

TEST(Locale, DecimalCommaOfTheCxxLibrary_ReachesNoDeck) {
    const std::locale former = std::locale::global(std::locale(std::locale::classic(), new CommaAndGroups));
    const std::string text = SampleText();
    std::locale::global(former);
    EXPECT_EQ(text, kSample);
}

} // namespace
