#include <algorithm>
#include <tuple>

#include "platform/files.h"
#include "tests/contract/machine.h"

namespace {

using namespace contract;

class Files : public Machine {
 protected:
  const string a_ = here_ + "A\xE7\xE3o.smc", b_ = here_ + "b.smc", missing_ = here_ + "missing.smc";
};

TEST_F(Files, OpenAsTheAccessSays) {
  Put(a_, "0123456789");
  const struct {
    const char* Name;
    string Path;
    Access Wish;
    bool Opens;
    string After;
  } cases[] = {
      {"a missing one, to read", missing_, Access::Read, false, "(none)"},
      {"to read", a_, Access::Read, true, "0123456789"},
      {"to write", a_, Access::ReadWrite, true, "0123456789"},
      {"a missing one, to write", here_ + "new1", Access::ReadWrite, true, ""},
      {"in a missing directory", here_ + "nowhere\\x", Access::ReadWrite, false, "(none)"},
      {"a directory", here_, Access::Read, false, "(none)"},
      {"a path that names nothing", a_ + Zero, Access::ReadWrite, false, "(none)"},
      {"a new one where one is", a_, Access::CreateNew, false, "0123456789"},
      {"a new one", here_ + "new2", Access::CreateNew, true, ""},
      {"a new one where a directory is", here_, Access::CreateNew, false, "(none)"},
      {"alone", a_, Access::Alone, true, "0123456789"},
      {"a missing one, alone", missing_, Access::Alone, false, "(none)"},
  };
  for (const auto& [name, path, access, opens, after] : cases) {
    SCOPED_TRACE(name);
    File file(path, access), moved = std::move(file);
    EXPECT_EQ(moved.IsOpen() && moved.Size() >= 0, opens);
    moved.Close();
    for (File* closed : {&file, &moved}) {
      EXPECT_FALSE(closed->IsOpen());
      EXPECT_LT(closed->Size(), 0);
      EXPECT_FALSE(closed->Write(0, "x"));
      EXPECT_FALSE(closed->Flush());
    }
    EXPECT_EQ(Content(path), after);
  }
  SetAttributes(a_, AttributeReadOnly);
  EXPECT_EQ(File(a_, Access::ReadWrite).IsOpen(), IsWine());
  Put(b_, "hidden");
  SetAttributes(b_, AttributeHidden);
  Put(b_, "new");
  EXPECT_EQ(Content(b_), "new");
}

TEST_F(Files, OpenAloneLeaveAllOthersOut) {
  Put(a_, "x");
  for (const Access other : {Access::Read, Access::ReadWrite, Access::Alone}) {
    {
      const File first(a_, other);
      EXPECT_FALSE(File(a_, Access::Alone).IsOpen());
    }
    const File alone(a_, Access::Alone);
    EXPECT_TRUE(alone.IsOpen());
    EXPECT_FALSE(File(a_, other).IsOpen());
  }
}

TEST_F(Files, AreRecycledOnlyWhereTheyCouldBeDeleted) {
  Put(a_);
  ASSERT_TRUE(CreateDirectoryA(here_ + "dir"));
  {
    const File open(a_, Access::Read);
    EXPECT_FALSE(MoveToRecycleBin(a_)) << "open";
  }
  EXPECT_FALSE(MoveToRecycleBin(missing_));
  EXPECT_FALSE(MoveToRecycleBin(here_ + "dir"));
  EXPECT_TRUE(GetFileAttributesA(here_ + "dir"));
  const bool moved = MoveToRecycleBin(a_);  // the shell may not be able to
  EXPECT_EQ(GetFileAttributesA(a_).has_value(), !moved);
}

TEST_F(Files, BytePositionsAndSizesAreExact) {
  File file(a_, Access::ReadWrite), reader(a_, Access::Read), other(a_, Access::ReadWrite);
  EXPECT_TRUE(file.Write(0, string("\0\r\n\x1A\xFF|=", 7)));
  EXPECT_TRUE(other.Write(other.Size(), "end"));
  EXPECT_TRUE(file.Write(2, "X"));
  EXPECT_TRUE(file.Write(3, ""));
  const std::tuple<std::int64_t, std::size_t, string> cases[] = {
      {0, 4, string("\0\rX\x1A", 4)}, {3, 1, "\x1A"}, {6, 9, "=end"}, {10, 5, ""}, {99, 5, ""}};
  for (const auto& [position, length, bytes] : cases) {
    string buffer(length, '?');
    ASSERT_EQ(reader.Read(position, buffer.data(), length), std::ssize(bytes)) << position;
    EXPECT_EQ(buffer.substr(0, bytes.size()), bytes);
  }
  EXPECT_FALSE(reader.Write(0, "x"));
  EXPECT_FALSE(reader.SetSize(0));
  EXPECT_TRUE(file.Write(12, "beyond"));  // the gap is zeros
  EXPECT_EQ(Content(a_).substr(9), string("d\0\0beyond", 9));
  EXPECT_TRUE(file.SetSize(2));
  EXPECT_TRUE(file.SetSize(4));
  EXPECT_TRUE(file.Flush());
  EXPECT_EQ(Content(a_), string("\0\r\0\0", 4));
  Put(b_, "b");
  EXPECT_FALSE(DeleteFileA(a_)) << "as it is open";
  EXPECT_FALSE(DeleteAbandonedFile(a_, 0)) << "as it is open";
  EXPECT_FALSE(MoveFileExA(a_, missing_, Existing::Keep)) << "as it is open";
  EXPECT_FALSE(MoveFileExA(b_, a_, Existing::Replace)) << "as it is open";
}

TEST_F(Files, LengthsAndAttributesNeedNoOpenFileAndDecideWhatIsDeleted) {
  const string folder = here_ + "Pasta";
  EXPECT_TRUE(CreateDirectoryA(folder));
  EXPECT_FALSE(CreateDirectoryA(folder + "\\"));
  EXPECT_FALSE(CreateDirectoryA(here_ + "nowhere\\sub"));
  Put(a_, "12345");
  Put(b_);
  SetAttributes(a_, AttributeReadOnly | AttributeHidden);
  SetAttributes(b_, AttributeNormal);
  const struct {
    const char* Name;
    string Path;
    std::optional<std::uint32_t> Attributes;
    std::optional<std::int64_t> Size;
  } cases[] = {
      {"read-only and hidden", a_, AttributeReadOnly | AttributeHidden, 5},
      {"in another letter case", here_ + "A\xC7\xC3O.SMC", AttributeReadOnly | AttributeHidden, 5},
      {"a path that names nothing", b_ + Zero, {}, {}},
      {"an empty one", b_, 0, 0},
      {"a directory", here_ + "PASTA\\", AttributeDirectory, {}},
      {"missing", missing_, {}, {}},
  };
  for (const auto& [name, path, expected, size] : cases) {
    SCOPED_TRACE(name);
    std::optional<std::uint32_t> attributes = GetFileAttributesA(path);
    if (attributes && size) *attributes &= AttributeReadOnly | AttributeHidden;  // each disk keeps others
    EXPECT_EQ(attributes, expected);
    EXPECT_EQ(FileSize(path), size);
    EXPECT_EQ(DeleteFileA(path), path == b_);
  }
  EXPECT_EQ(Content(a_) + Content(b_), "12345(none)");
}

// What becomes of the file b ("old") when the read-only file a ("new") gets its name.
TEST_F(Files, MoveReplacesOrKeeps) {
  const struct {
    const char* Name;
    std::uint32_t Attributes;  // of b; 0: there is none
    string From, To;
    Existing Wish;
    bool Succeeds;
  } cases[] = {{"no b", 0, a_, b_, Existing::Replace, true},
               {"no b to keep", 0, a_, b_, Existing::Keep, true},
               {"replaced", AttributeArchive, a_, b_, Existing::Replace, true},
               {"kept", AttributeArchive, a_, b_, Existing::Keep, false},
               {"read-only", AttributeReadOnly, a_, b_, Existing::Replace, false},
               {"no source", AttributeArchive, missing_, b_, Existing::Replace, false},
               {"no directory", AttributeArchive, a_, here_ + "nowhere\\x", Existing::Replace, false},
               {"a path that names nothing", AttributeArchive, a_, b_ + Zero, Existing::Replace, false}};
  for (const auto& each : cases) {
    if (each.Attributes == AttributeReadOnly && IsWine()) continue;
    SCOPED_TRACE(each.Name);
    for (const string& left : {a_, b_}) SetAttributes(left, AttributeNormal), DeleteFileA(left);
    Put(a_, "new");
    if (each.Attributes != 0) Put(b_, "old");
    SetAttributes(a_, AttributeReadOnly);
    SetAttributes(b_, each.Attributes);
    EXPECT_EQ(MoveFileExA(each.From, each.To, each.Wish), each.Succeeds);
    EXPECT_EQ(Content(b_), each.Succeeds ? "new" : "old");
    EXPECT_EQ(Content(a_), each.Succeeds ? "(none)" : "new");
    EXPECT_EQ(ListDirectory(here_, "*").size(), each.Succeeds ? 1u : 2u);
  }
  Put(b_, "last");
  EXPECT_TRUE(MoveFileExA(b_, here_ + "B.smc", Existing::Replace));  // onto itself
}

TEST_F(Files, AreAbandonedOnceTheyAreOldAndNobodyHasThemOpen) {
  Put(a_, "source");
  Put(b_, "copy");
  SetAge(a_, 30);
  EXPECT_FALSE(DeleteAbandonedFile(a_, 60)) << "younger than that";
  SetAge(a_, 90);
  SetAttributes(a_, AttributeReadOnly | AttributeArchive);
  {
    File source(a_, Access::Read), copy(b_, Access::ReadWrite);
    EXPECT_TRUE(copy.CopyInformation(source));
    EXPECT_FALSE(DeleteAbandonedFile(b_, 60)) << "open, and as old as its source";
  }
  EXPECT_EQ(GetFileAttributesA(b_).value_or(0) & AttributeReadOnly, 0u);
  EXPECT_TRUE(DeleteAbandonedFile(b_, 60));
  for (const string& none : {b_, missing_, here_, a_ + Zero}) EXPECT_FALSE(DeleteAbandonedFile(none, 0)) << none;
  EXPECT_EQ(Content(a_) + Content(b_), "source(none)");
}

TEST_F(Files, HaveOneFinalPathHoweverTheyAreReached) {
  Put(a_);
  ASSERT_TRUE(CreateDirectoryA(here_ + "dir"));
  const auto file = GetFinalPathNameA(a_), directory = GetFinalPathNameA(here_);
  ASSERT_TRUE(file && directory);
  EXPECT_EQ(*file, *GetFinalPathNameA(here_.substr(0, here_.size() - 1)) + "\\A\xE7\xE3o.smc");
  EXPECT_EQ(GetFinalPathNameA(here_ + "dir\\..\\a\xE7\xE3O.smc"), file);
  EXPECT_EQ(GetFinalPathNameA(GetShortPathNameA(a_, 260).value_or("")), file);
  EXPECT_EQ(GetFinalPathNameA(missing_), std::nullopt);
}

TEST_F(Files, DisksTellTheirSpaceAndTakeADirectoryWhenTheyAreThere) {
  const string drive = here_.substr(0, 2), root = drive + "\\";
  const auto space = GetDiskFreeSpaceA(drive).value_or(DiskFreeSpace{});
  EXPECT_GT(space.SectorsPerCluster, 0U);
  EXPECT_GT(space.BytesPerSector, 0U);
  EXPECT_GT(space.TotalClusters, 0U);
  EXPECT_TRUE(SetDriveDirectory(root));
  for (const string& none : {string("q:\\"), here_ + "nowhere\\", root + Zero, string()}) {
    EXPECT_FALSE(GetDiskFreeSpaceA(none)) << none;
    EXPECT_FALSE(SetDriveDirectory(none)) << none;
  }
  const auto roots = FixedDrives();
  EXPECT_EQ(std::count(roots.begin(), roots.end(), root), 1);
  EXPECT_TRUE(std::is_sorted(roots.begin(), roots.end()));
}

}  // namespace
