#include <gtest/gtest.h>

#include "platform/files.h"
#include "platform/text.h"
#include "platform/wildcards.h"
#include "tests/contract/machine.h"

namespace {

using namespace platform;
using std::string;

using Names = std::vector<string>;

void Put(const contract::FreshDirectory& directory, const Names& names) {
  for (const string& name : names) ASSERT_TRUE(File(directory / name, Access::ReplaceContent).IsOpen()) << name;
}

Names Listed(const string& directory, const string& patterns) {
  Names names;
  for (const DirectoryEntry& entry : ListDirectory(directory, patterns)) names.push_back(entry.Name);
  return names;
}

TEST(Wildcards, Match) {
  struct {
    const char *Name, *Patterns;
    bool Matches;
  } const cases[] = {{"A.ZIP", "*.ZIP", true},
                     {"A.ZIPX", "*.ZIP", false},
                     {".ZIP", "*.ZIP", true},
                     {"A.ZIP", "*.SMC;*.ZIP", true},
                     {"A.ZIP", ";;*.ZIP;", true},
                     {"A.ZIP", "", false},
                     {"A.ZIP", ";", false},
                     {"", "*", true},
                     {"", "?", false},
                     {"A.ZIP.SMC", "*.SMC", true},
                     {"A.ZIP.ZIP", "*.ZIP", true},
                     {"ABAB", "*AB", true},
                     {"ABABC", "*AB?", true},
                     {"ABAC", "A*B*C", true},
                     {"ABA", "A*B*C", false},
                     {"A.ZS1", "*.ZS?", true},
                     {"A.ZS", "*.ZS?", false},
                     {"A.ZS12", "*.ZS?", false},
                     {"A", "A**", true},
                     {"AB", "A", false},
                     {"A", "AB", false}};
  for (const auto& each : cases) {
    EXPECT_EQ(MatchesAnyPattern(each.Name, each.Patterns), each.Matches) << each.Name << " " << each.Patterns;
  }
}

TEST(Listings, HoldTheFilesThatMatchAndCanBeSeen) {
  const contract::FreshDirectory directory;
  Put(directory, {"one.zip", "TWO.ZIP", "three.zipx", "four.smc", "five.SMC.txt", "six", "seven.zip.smc", "eight.zi",
                  "A\xE7\xE3o.SmC", "hidden.zip", "system.zip", "readonly.zip"});
  ASSERT_TRUE(CreateDirectoryA(directory / "folder.zip"));
  contract::SetAttributes(directory / "hidden.zip", AttributeHidden);
  contract::SetAttributes(directory / "system.zip", AttributeSystem | AttributeArchive);
  contract::SetAttributes(directory / "readonly.zip", AttributeReadOnly);
  struct {
    string Directory, Patterns;
    Names Expected;
  } const cases[] = {
      {directory.Path(),
       "*.zip;*.smc",
       {"A\xE7\xE3o.SmC", "four.smc", "one.zip", "readonly.zip", "seven.zip.smc", "TWO.ZIP"}},
      {directory.Path(), "*.ZIP", {"one.zip", "readonly.zip", "TWO.ZIP"}},
      {directory.Path(), "*.zip;*.zip", {"one.zip", "readonly.zip", "TWO.ZIP"}},  // each file once
      {directory.Path(), "a\xC7*", {"A\xE7\xE3o.SmC"}},
      {directory.Path(), "???", {"six"}},
      {directory.Path(), "*.tvk", {}},
      {directory.Path(), "", {}},
      {directory / "nowhere\\", "*", {}},
      {directory / "one.zip\\", "*", {}},
      {directory.Path() + string("\0", 1), "*", {}},
      {"q:\\", "*", {}},
  };
  for (const auto& each : cases) {
    EXPECT_EQ(Listed(each.Directory, each.Patterns), each.Expected) << each.Directory << " " << each.Patterns;
  }
}

TEST(Listings, AreInTheOrderOfTheirNames) {
  const contract::FreshDirectory directory;
  const Names ascending = {"!a.smc",      "(b).smc", "_c.smc",     "10.smc",       "2.smc",      "a-b.smc",   "abc.smc",
                           "\xC1gua.smc", "cao.smc", "C\xC3O.zip", "c\xE3o s.smc", "coop.smc",   "co-op.smc", "e.smc",
                           "\xC9.smc",    "F.smc",   "Jogo 1.smc", "jogo 10.smc",  "Jogo 2.smc", "zebra.smc"};
  Put(directory, Names(ascending.rbegin(), ascending.rend()));
  const Names listed = Listed(directory.Path(), "*");
  ASSERT_EQ(listed.size(), ascending.size());
  for (std::size_t i = 1; i < listed.size(); ++i) {
    EXPECT_LT(CompareStringA(listed[i - 1], listed[i]), 0) << listed[i - 1] << " before " << listed[i];
  }
}

TEST(Listings, ShortNamesAreThoseOfTheShortPath) {
  const contract::FreshDirectory directory;
  Put(directory, {"JOGOUM.SMC", "Jogo com nome comprido.smc", "Jogo com nome comprido 2.smc",
                  "A\xE7\xE3o total mesmo.zip", "a.b.c.zip", "x.zipx"});
  const auto entries = ListDirectory(directory.Path(), "*");
  ASSERT_EQ(entries.size(), 6u);
  for (const DirectoryEntry& entry : entries) {
    const string path = directory / entry.Name;
    const auto shortPath = GetShortPathNameA(path, 4096);
    ASSERT_TRUE(shortPath) << path;
    const string last = shortPath->substr(shortPath->rfind('\\') + 1);
    EXPECT_EQ(last, entry.ShortName.empty() ? entry.Name : entry.ShortName);
    EXPECT_EQ(FileSize(*shortPath), 0) << *shortPath;
    EXPECT_EQ(ListPath(path), entry);
    EXPECT_EQ(ListPath(*shortPath), entry);
    EXPECT_EQ(GetShortPathNameA(path, shortPath->size() + 1), shortPath);
    EXPECT_FALSE(GetShortPathNameA(path, shortPath->size()));
  }
  EXPECT_FALSE(GetShortPathNameA(directory / "missing.smc", 4096));
  EXPECT_FALSE(GetShortPathNameA(directory / "x.zipx" + string("\0", 1), 4096));
}

TEST(Listings, OnePathIsListedWithoutWildcards) {
  const contract::FreshDirectory directory;
  Put(directory, {"One.zip", "hidden.zip", "system.zip"});
  ASSERT_TRUE(CreateDirectoryA(directory / "folder"));
  contract::SetAttributes(directory / "hidden.zip", AttributeHidden);
  contract::SetAttributes(directory / "system.zip", AttributeSystem);
  EXPECT_EQ(ListPath(directory / "oNE.ZIP").value_or(DirectoryEntry{}).Name, "One.zip");
  for (const string name : {"one.*", "?ne.zip", "on<", "one\"zip", "hidden.zip", "system.zip", "folder", "folder\\", "",
                            "missing", "nowhere\\x"}) {
    EXPECT_FALSE(ListPath(directory / name)) << name;
  }
  EXPECT_FALSE(ListPath(directory / "One.zip" + string("\0", 1)));
}

}  // namespace
