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
  const std::tuple<string, Access, bool, string> cases[] = {{missing_, Access::Read, false, "(none)"},
                                                            {a_, Access::Read, true, "0123456789"},
                                                            {a_, Access::ReadWrite, true, "0123456789"},
                                                            {here_ + "new1", Access::ReadWrite, true, ""},
                                                            {here_ + "nowhere\\x", Access::ReadWrite, false, "(none)"},
                                                            {here_, Access::Read, false, "(none)"},
                                                            {a_ + Zero, Access::ReadWrite, false, "(none)"},
                                                            {a_, Access::CreateNew, false, "0123456789"},
                                                            {here_ + "new2", Access::CreateNew, true, ""},
                                                            {here_, Access::CreateNew, false, "(none)"}};
  for (const auto& [path, access, opens, after] : cases) {
    File file(path, access), moved = std::move(file);
    EXPECT_EQ(moved.IsOpen() && moved.Size() >= 0, opens) << path;
    moved.Close();
    for (File* closed : {&file, &moved}) {
      EXPECT_FALSE(closed->IsOpen() || closed->Size() >= 0 || closed->Write(0, "x") || closed->Flush()) << path;
    }
    EXPECT_EQ(Content(path), after) << path;
  }
  SetAttributes(a_, AttributeReadOnly);
  EXPECT_EQ(File(a_, Access::ReadWrite).IsOpen(), IsWine());
  Put(b_, "hidden");
  SetAttributes(b_, AttributeHidden);
  Put(b_, "new");
  EXPECT_EQ(Content(b_), "new");
}

TEST_F(Files, BytePositionsAndSizesAreExact) {
  File file(a_, Access::ReadWrite), reader(a_, Access::Read), other(a_, Access::ReadWrite);
  EXPECT_TRUE(file.Write(0, string("\0\r\n\x1A\xFF|=", 7)) && other.Write(other.Size(), "end"));
  EXPECT_TRUE(file.Write(2, "X") && file.Write(3, ""));
  const std::tuple<std::int64_t, std::size_t, string> cases[] = {
      {0, 4, string("\0\rX\x1A", 4)}, {3, 1, "\x1A"}, {6, 9, "=end"}, {10, 5, ""}, {99, 5, ""}};
  for (const auto& [position, length, bytes] : cases) {
    string buffer(length, '?');
    ASSERT_EQ(reader.Read(position, buffer.data(), length), std::ssize(bytes)) << position;
    EXPECT_EQ(buffer.substr(0, bytes.size()), bytes);
  }
  EXPECT_FALSE(reader.Write(0, "x") || reader.SetSize(0));
  EXPECT_TRUE(file.Write(12, "beyond"));  // the gap is zeros
  EXPECT_EQ(Content(a_).substr(9), string("d\0\0beyond", 9));
  EXPECT_TRUE(file.SetSize(2) && file.SetSize(4) && file.Flush());
  EXPECT_EQ(Content(a_), string("\0\r\0\0", 4));
  Put(b_, "b");
  EXPECT_FALSE(DeleteFileA(a_) || DeleteAbandonedFile(a_, 0) || MoveFileExA(a_, missing_, Existing::Keep) ||
               MoveFileExA(b_, a_, Existing::Replace));  // as it is open
}

TEST_F(Files, LengthsAndAttributesNeedNoOpenFileAndDecideWhatIsDeleted) {
  const string folder = here_ + "Pasta";
  EXPECT_TRUE(CreateDirectoryA(folder));
  EXPECT_FALSE(CreateDirectoryA(folder + "\\") || CreateDirectoryA(here_ + "nowhere\\sub"));
  Put(a_, "12345");
  Put(b_);
  SetAttributes(a_, AttributeReadOnly | AttributeHidden);
  SetAttributes(b_, AttributeNormal);
  const std::tuple<string, std::optional<std::uint32_t>, std::optional<std::int64_t>> cases[] = {
      {a_, AttributeReadOnly | AttributeHidden, 5},
      {here_ + "A\xC7\xC3O.SMC", AttributeReadOnly | AttributeHidden, 5},  // in other case
      {b_ + Zero, {}, {}},
      {b_, 0, 0},
      {here_ + "PASTA\\", AttributeDirectory, {}},
      {missing_, {}, {}}};
  for (const auto& [path, expected, size] : cases) {
    std::optional<std::uint32_t> attributes = GetFileAttributesA(path);
    if (attributes && size) *attributes &= AttributeReadOnly | AttributeHidden;  // each disk keeps others
    EXPECT_EQ(attributes, expected) << path;
    EXPECT_EQ(FileSize(path), size) << path;
    EXPECT_EQ(DeleteFileA(path), path == b_) << path;
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

TEST_F(Files, DisksTellTheirSpaceAndTakeADirectoryWhenTheyAreThere) {
  const string drive = here_.substr(0, 2), root = drive + "\\";
  const auto space = GetDiskFreeSpaceA(drive).value_or(DiskFreeSpace{});
  EXPECT_TRUE(space.SectorsPerCluster > 0 && space.BytesPerSector > 0 && space.TotalClusters > 0);
  EXPECT_TRUE(SetDriveDirectory(root));
  for (const string& none : {string("q:\\"), here_ + "nowhere\\", root + Zero, string()}) {
    EXPECT_FALSE(GetDiskFreeSpaceA(none) || SetDriveDirectory(none)) << none;
  }
  const auto roots = FixedDrives();
  EXPECT_TRUE(std::count(roots.begin(), roots.end(), root) == 1 && std::is_sorted(roots.begin(), roots.end()));
}

}  // namespace
