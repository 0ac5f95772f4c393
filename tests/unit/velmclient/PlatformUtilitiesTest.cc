#include "Velm/PlatformUtilities.h"

#include <gtest/gtest.h>
#include <stdlib.h>

#include <string>

#include "ChildProcess.h"
#include "support/TempDirectory.h"

namespace Velm {
namespace {

using support::TempDirectory;

// All answers in a process of its own, since a process reads its configuration once.
std::string answersWith(const std::string& configurationFile) {
    return runInChild([&] {
        ::setenv("VELM_CONFIG", configurationFile.c_str(), 1);
        std::string answers;
        for (const char* answer :
             {PlatformUtilities::getSennetDirectory(), PlatformUtilities::getSennetResourceFile(),
              PlatformUtilities::getMIFOutputDirectory("/SMS"),
              PlatformUtilities::getMIFOutputDirectory("/CA"),
              PlatformUtilities::getMIFOutputDirectory("/QVE"),
              PlatformUtilities::getMIFOutputDirectory("/LD"),
              PlatformUtilities::getSQLOutputDirectory("/SMS"),
              PlatformUtilities::getSQLOutputDirectory("/QVE")}) {
            answers += std::string(answer) + '\n';
        }
        return answers;
    });
}

TEST(PlatformUtilities, SeparatorIsTheSlash) {
    EXPECT_EQ(PlatformUtilities::getSeparator(), '/');
}

TEST(PlatformUtilities, WithoutConfigurationThePlacesAreThoseOfTheInstallation) {
    const TempDirectory directory;
    const std::string data =
        INSTALLED_DATA_DIR "/sennet\n" INSTALLED_DATA_DIR "/sennet/sennet.properties\n";
    const std::string mif = INSTALLED_STATE_DIR "/lib/sennet/mif\n";
    const std::string sql = INSTALLED_STATE_DIR "/lib/sennet/sql\n";
    const std::string expected = data + mif + mif + mif + mif + sql + sql;
    EXPECT_EQ(answersWith(directory.path("missing")), expected);
    EXPECT_EQ(answersWith(directory.write("empty", "")), expected);
    EXPECT_EQ(answersWith(directory.path()), expected);
}

TEST(PlatformUtilities, ConfiguredPlacesWinAndThoseOfAProductWinOverThem) {
    const TempDirectory directory;
    const std::string file = directory.write("velm.properties",
                                             "sennet.directory = /opt/scripts\n"
                                             "sennet.resources: relative/x.properties\n"
                                             "mif.directory=/srv/mif\n"
                                             "mif.directory.CA=/srv/ca mif\n"
                                             "mif.directory.LD=../ld/\n"
                                             "sql.directory.QVE=/srv/qve\n"
                                             "sql.directory=/srv/sql\n");
    EXPECT_EQ(answersWith(file),
              "/opt/scripts\n"
              "relative/x.properties\n"
              "/srv/mif\n"
              "/srv/ca mif\n"
              "/srv/mif\n"
              "../ld/\n"
              "/srv/sql\n"
              "/srv/qve\n");
}

TEST(PlatformUtilities, AnEmptyValueIsAsGoodAsNone) {
    const TempDirectory directory;
    const std::string file = directory.write("velm.properties",
                                             "sennet.directory=\n"
                                             "sennet.resources=/r\n"
                                             "mif.directory=/m\n"
                                             "mif.directory.SMS=\n"
                                             "sql.directory=\n"
                                             "sql.directory.SMS=/s\n");
    EXPECT_EQ(answersWith(file), INSTALLED_DATA_DIR
              "/sennet\n/r\n/m\n/m\n/m\n/m\n/s\n" INSTALLED_STATE_DIR "/lib/sennet/sql\n");
}

TEST(PlatformUtilities, TheTypeMayBeNullEmptyUnknownOrWithoutSlash) {
    const TempDirectory directory;
    const std::string file = directory.write("velm.properties",
                                             "mif.directory=/general\n"
                                             "mif.directory.SMS=/sms\n");
    const std::string answers = runInChild([&] {
        ::setenv("VELM_CONFIG", file.c_str(), 1);
        std::string result;
        for (const char* type :
             {static_cast<const char*>(nullptr), "", "/", "/XYZ", "/sms", "SMS", "/SMS"}) {
            result += std::string(PlatformUtilities::getMIFOutputDirectory(type)) + ' ';
        }
        return result;
    });
    EXPECT_EQ(answers, "/general /general /general /general /general /sms /sms ");
}

TEST(PlatformUtilities, TheConfigurationIsReadOnceAndItsTextsStay) {
    const TempDirectory directory;
    const std::string file = directory.write("velm.properties", "mif.directory=/first");
    const std::string answer = runInChild([&] {
        ::setenv("VELM_CONFIG", file.c_str(), 1);
        const char* first = PlatformUtilities::getMIFOutputDirectory("/SMS");
        directory.write("velm.properties", "mif.directory=/second");
        const char* second = PlatformUtilities::getMIFOutputDirectory("/SMS");
        return std::string(first) + ' ' + second + (first == second ? " same" : " other");
    });
    EXPECT_EQ(answer, "/first /first same");
}

std::string convertedUnder(const char* locale, const char* text) {
    return runInChild([&] {
        ::setenv("LC_ALL", locale, 1);
        const char* converted = PlatformUtilities::convertStringFromPlatform(text);
        std::string result = converted;
        PlatformUtilities::freeConvertedString(converted);
        return result;
    });
}

TEST(PlatformUtilities, TextIsConvertedFromTheLocale) {
    EXPECT_EQ(convertedUnder("C.UTF-8", "/tmp/\xC3\xB6"), "/tmp/\xC3\xB6");
    EXPECT_EQ(convertedUnder("C", "/tmp/\xC3\xB6"), "/tmp/\xC3\xB6");
    EXPECT_EQ(convertedUnder("C", "/SMS"), "/SMS");
    EXPECT_EQ(convertedUnder("C", ""), "");
    EXPECT_EQ(convertedUnder("xx_YY.no-such-locale", "a\xE9"), "a\xE9");
}

TEST(PlatformUtilities, NullIsConvertedToNull) {
    EXPECT_EQ(PlatformUtilities::convertStringFromPlatform(nullptr), nullptr);
    PlatformUtilities::freeConvertedString(nullptr);
}

}  // namespace
}  // namespace Velm
