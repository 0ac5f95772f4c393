#include "providers/software/SoftwareIdentityProvider.h"

#include <gtest/gtest.h>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "RecordedTree.h"
#include "SchemaConformance.h"

namespace cimomd {
namespace {

class SoftwareIdentityProviderTest : public testing::Test {
  protected:
    RecordedTree tree;
    FixedSystemCalls calls;
};

SoftwarePackage vim() {
    SoftwarePackage package;
    package.name = "vim";
    package.architecture = "amd64";
    package.identity = "vim:amd64";
    package.version = "2:9.0.1378-2";
    package.upstreamVersion = "9.0.1378";
    package.manufacturer = std::string("Vim Maintainers");
    package.summary = std::string("Vi IMproved");
    package.section = std::string("editors");
    package.installedKB = 3738;
    package.installTime = 1700000000;
    return package;
}

TEST_F(SoftwareIdentityProviderTest, publishesADebianPackage) {
    const auto instance = SoftwareIdentityProvider::publish(vim(), 60).instance;
    EXPECT_EQ(textOf(instance, "InstanceID"), "Velmira:deb:vim:amd64");
    EXPECT_EQ(textOf(instance, "Name"), "vim");
    EXPECT_EQ(textOf(instance, "Caption"), "Vi IMproved");
    EXPECT_EQ(textOf(instance, "ElementName"), "Vi IMproved");
    EXPECT_EQ(textOf(instance, "VersionString"), "2:9.0.1378-2");
    EXPECT_EQ(textOf(instance, "MajorVersion"), "9");
    EXPECT_EQ(textOf(instance, "MinorVersion"), "0");
    EXPECT_EQ(textOf(instance, "RevisionNumber"), "1378");
    EXPECT_EQ(textOf(instance, "BuildNumber"), "null");
    EXPECT_EQ(textOf(instance, "Manufacturer"), "Vim Maintainers");
    EXPECT_EQ(textOf(instance, "Classifications"), "1 ");
    EXPECT_EQ(textOf(instance, "ClassificationDescriptions"), "editors ");
    EXPECT_EQ(textOf(instance, "IsEntity"), "TRUE");
    EXPECT_EQ(textOf(instance, "ExtendedResourceType"), "8");
    // 1700000000 is 14 November 2023, 22:13:20 UTC.
    EXPECT_EQ(textOf(instance, "InstallDate"), "20231114231320.000000+060");
    EXPECT_EQ(textOf(instance, "Architecture"), "amd64");
    EXPECT_EQ(textOf(instance, "InstalledSizeKB"), "3738");
}

TEST_F(SoftwareIdentityProviderTest, publishesAnRpmPackageThatTellsLittle) {
    SoftwarePackage package;
    package.format = PackageFormat::Rpm;
    package.name = "tool";
    package.identity = "tool-x-1.noarch";
    package.version = "x-1";
    package.upstreamVersion = "x";
    package.installedKB = std::uint64_t{1} << 31;
    const ProvidedInstance provided = SoftwareIdentityProvider::publish(package, 0);
    EXPECT_EQ(textOf(provided.instance, "InstanceID"), "Velmira:rpm:tool-x-1.noarch");
    EXPECT_EQ(textOf(provided.instance, "ExtendedResourceType"), "3");
    EXPECT_EQ(textOf(provided.instance, "Caption"), "tool");
    for (const char* property : {"MajorVersion", "Manufacturer", "Classifications", "InstallDate",
                                 "ClassificationDescriptions", "InstalledSizeKB"})
        EXPECT_EQ(textOf(provided.instance, property), "null") << property;
}

TEST_F(SoftwareIdentityProviderTest, listsPackagesInOrder) {
    std::string status;
    for (const char* name : {"zsh", "apt", "make"})
        status += std::string("Package: ") + name +
                  "\nStatus: install ok installed\nArchitecture: all\nMaintainer: M\nVersion: 1\n"
                  "Description: d\n\n";
    tree.file("var/lib/dpkg/status", status);
    const SoftwareIdentityProvider provider(tree.paths(), calls);
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 3U);
    EXPECT_EQ(textOf(instances[0], "Name"), "apt");
    EXPECT_EQ(textOf(instances[1], "Name"), "make");
    EXPECT_EQ(textOf(instances[2], "Name"), "zsh");
    expectServesItsClass(provider);
}

TEST_F(SoftwareIdentityProviderTest, joinsBothKindsAndKeepsNoPackageTwice) {
    tree.file("var/lib/dpkg/status", "").file("var/lib/rpm/Packages", "");
    const auto tool = [this](const char* name, const std::string& record) {
        tree.file(name, "#!/bin/sh\nprintf '" + record + record + "'\n");
        std::filesystem::permissions(tree.root / name, std::filesystem::perms::owner_all);
        return tree.root / name;
    };
    const SoftwareIdentityProvider provider(
        tree.paths(), calls,
        {tool("dpkg-query", "installed\\037a\\037all\\0371\\037M\\037s\\0371\\037t\\037\\036"),
         tool("rpm", "b\\037(none)\\0371\\0372\\037x\\037v\\037p\\037g\\0371\\0371\\037t\\036")});
    const auto instances = all(provider.enumerate());
    ASSERT_EQ(instances.size(), 2U);
    EXPECT_EQ(textOf(instances[0], "InstanceID"), "Velmira:deb:a:all");
    EXPECT_EQ(textOf(instances[1], "InstanceID"), "Velmira:rpm:b-1-2.x");
}

// A database that could not be read was as good as none when there was another one.
TEST_F(SoftwareIdentityProviderTest, saysWhenADatabaseCannotBeRead) {
    tree.file("var/lib/dpkg/status", "").file("var/lib/rpm/Packages", "");
    const auto tool = [this](const char* name, const std::string& commands) {
        tree.file(name, "#!/bin/sh\n" + commands + "\n");
        std::filesystem::permissions(tree.root / name, std::filesystem::perms::owner_all);
        return tree.root / name;
    };
    const SoftwareIdentityProvider provider(
        tree.paths(), calls,
        {tool("dpkg-query",
              "printf 'installed\\037a\\037all\\0371\\037M\\037s\\0371\\037t\\037\\036'"),
         tool("rpm", "exit 1")});
    const auto stream = provider.enumerate();
    ProvidedInstance provided;
    EXPECT_TRUE(stream->next(provided));
    EXPECT_FALSE(stream->next(provided));
    EXPECT_EQ(stream->absence(), Absence::Unreadable);
}

TEST_F(SoftwareIdentityProviderTest, saysWhyThereAreNoPackages) {
    const SoftwareIdentityProvider provider(tree.paths(), calls);
    const auto nothing = provider.enumerate();
    EXPECT_EQ(nothing->absence(), Absence::Absent);
    EXPECT_TRUE(all(provider.enumerate()).empty());
    tree.file("var/lib/dpkg/status", "no database\n");
    EXPECT_EQ(provider.enumerate()->absence(), Absence::Unreadable);
}

}  // namespace
}  // namespace cimomd
