#include <tuple>
#include <vector>

#include "platform/text.h"
#include "tests/contract/machine.h"

namespace {

using namespace contract;

using Names = std::vector<string>;

class Listings : public Machine {
 protected:
  // Files and directories that each listing has to tell apart.
  Listings() {
    for (const char* name :
         {"One.zip", "TWO.ZIP", "three.zipx", "coop.smc", "five.SMC.txt", "six", "seven.zip.smc", "co-op.smc",
          "A\xE7\xE3o.SmC", "hidden.zip", "system.zip", "readonly.zip", "Jogo 2.smc", "jogo 10.smc"}) {
      Put(here_ + name);
    }
    for (const char* name : {"Zebra", "emu 10", "\xC1gua", "EMU 2.zip", "hidden", "system", "readonly", "Zebra\\in"}) {
      EXPECT_TRUE(CreateDirectoryA(here_ + name)) << name;
    }
    for (const string end : {"", ".zip"}) {
      SetAttributes(here_ + "hidden" + end, AttributeHidden);
      SetAttributes(here_ + "system" + end, AttributeSystem);
      SetAttributes(here_ + "readonly" + end, AttributeReadOnly);
    }
  }
};

TEST_F(Listings, HoldInOrderWhatMatchesAndCanBeSeen) {
  for (const char* name : {"Zebra\\within.txt", "Zebra beside.txt"}) Put(here_ + name);
  const std::tuple<const char*, string, string, Names> cases[] = {
      {"one pattern",
       here_,
       "*.smc",
       {"A\xE7\xE3o.SmC", "coop.smc", "co-op.smc", "jogo 10.smc", "Jogo 2.smc", "seven.zip.smc"}},
      {"each file once", here_, "*.ZIP;*.zip;s*", {"One.zip", "readonly.zip", "seven.zip.smc", "six", "TWO.ZIP"}},
      {"empty patterns among them", here_, ";?ix;;*o*p.*c;?.zip", {"coop.smc", "co-op.smc", "six"}},
      {"in another letter case", here_, "a\xC7*", {"A\xE7\xE3o.SmC"}},
      {"no pattern", here_, "", {}},
      {"no directory", here_ + "nowhere\\", "*", {}},
      {"a directory without its last backslash", here_ + "Zebra", "*", {}},
      {"a path that names nothing", here_ + Zero, "*", {}},
  };
  for (const auto& [name, directory, patterns, expected] : cases) {
    Names names;
    for (const DirectoryEntry& entry : ListDirectory(directory, patterns)) names.push_back(entry.Name);
    EXPECT_EQ(names, expected) << name;
  }
  EXPECT_EQ(ListSubdirectories(here_), (Names{"\xC1gua", "emu 10", "EMU 2.zip", "readonly", "Zebra"}));
  EXPECT_EQ(ListSubdirectories(here_ + "Zebra\\"), Names{"in"});
  for (const string& none :
       {here_ + "Zebra\\in\\", here_ + "Zebra", here_ + "nowhere\\", here_ + Zero, string("q:\\")}) {
    EXPECT_EQ(ListSubdirectories(none), Names()) << none;
  }
  for (const string& name :
       Names{"one.*", "on<", "hidden.zip", "system.zip", "Zebra", "", "missing", "one.zip" + Zero}) {
    EXPECT_FALSE(ListPath(here_ + name)) << name;
  }
}

TEST_F(Listings, ShortNamesAreThoseOfTheShortPath) {
  for (const char* name : {"Jogo com nome comprido.smc", "Jogo com nome comprido 2.smc", "a.b.c.zip"})
    Put(here_ + name);
  const auto entries = ListDirectory(here_, "*");
  EXPECT_EQ(entries.size(), 15u);
  for (const DirectoryEntry& entry : entries) {
    const string path = here_ + entry.Name, shortPath = GetShortPathNameA(path, 4096).value_or("");
    EXPECT_EQ(shortPath.substr(shortPath.rfind('\\') + 1), entry.ShortName.empty() ? entry.Name : entry.ShortName);
    for (const string& each : {path, shortPath, CharUpperBuffA(path)}) EXPECT_EQ(ListPath(each), entry) << each;
    EXPECT_EQ(GetShortPathNameA(path, shortPath.size() + 1), shortPath);
    EXPECT_FALSE(GetShortPathNameA(path, shortPath.size()));
  }
  for (const string& none : {here_ + "missing.smc", here_ + "six" + Zero}) EXPECT_FALSE(GetShortPathNameA(none, 4096));
}

}  // namespace
