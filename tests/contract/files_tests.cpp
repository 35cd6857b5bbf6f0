#include <gtest/gtest.h>

#include "platform/files.h"
#include "tests/contract/machine.h"

namespace {

using namespace platform;
using std::string;

const string zero(1, '\0');

string Content(const string& path) {
  File file(path, Access::Read);
  if (!file.IsOpen()) return "(none)";
  string content(static_cast<std::size_t>(file.Size()), '?');
  EXPECT_EQ(file.Read(0, content.data(), content.size()), file.Size());
  return content;
}

void Put(const string& path, std::string_view content) {
  ASSERT_TRUE(File(path, Access::ReplaceContent).Write(0, content)) << path;
}

class Files : public testing::Test {
 protected:
  contract::FreshDirectory directory_;
  const string a_ = directory_ / "A\xE7\xE3o.smc", b_ = directory_ / "b.smc", missing_ = directory_ / "missing.smc";
};

TEST_F(Files, OpenAsTheAccessSays) {
  const string new1 = directory_ / "new1", new2 = directory_ / "new2";
  Put(a_, "0123456789");
  struct {
    string Path;
    enum Access How;
    bool Opens;
    string After;
  } const cases[] = {{missing_, Access::Read, false, "(none)"},
                     {a_, Access::Read, true, "0123456789"},
                     {a_, Access::ReadWrite, true, "0123456789"},
                     {new1, Access::ReadWrite, true, ""},
                     {new2, Access::ReplaceContent, true, ""},
                     {directory_ / "nowhere\\x", Access::ReadWrite, false, "(none)"},
                     {directory_.Path(), Access::Read, false, "(none)"},
                     {directory_.Path(), Access::ReadWrite, false, "(none)"},
                     {directory_ / "a*.smc", Access::ReplaceContent, false, "(none)"},
                     {"", Access::ReadWrite, false, "(none)"},
                     {a_ + zero, Access::ReadWrite, false, "(none)"},
                     {a_, Access::ReplaceContent, true, ""}};
  for (const auto& each : cases) {
    EXPECT_EQ(File(each.Path, each.How).IsOpen(), each.Opens) << each.Path;
    EXPECT_EQ(Content(each.Path), each.After) << each.Path;
  }
  contract::SetAttributes(a_, AttributeReadOnly);
  EXPECT_TRUE(File(a_, Access::Read).IsOpen());
  for (const Access access : {Access::ReadWrite, Access::ReplaceContent}) {
    EXPECT_EQ(File(a_, access).IsOpen(), !contract::ProtectsReadOnlyFiles());
  }
  Put(b_, "hidden");
  contract::SetAttributes(b_, AttributeHidden);
  Put(b_, "new");
  EXPECT_EQ(Content(b_), "new");
}

TEST_F(Files, BytePositionsAreExact) {
  File file(a_, Access::ReadWrite);
  const string bytes("\0\r\n\x1A\xFF|=", 7);
  EXPECT_TRUE(file.Write(0, bytes));
  EXPECT_TRUE(file.Write(file.Size(), "end"));
  EXPECT_TRUE(file.Write(2, "X"));
  EXPECT_TRUE(file.Write(3, ""));
  struct {
    std::int64_t Position;
    std::size_t Length;
    string Read;
  } const cases[] = {{0, 4, string("\0\rX\x1A", 4)},
                     {3, 1, "\x1A"},
                     {6, 9, "=end"},
                     {9, 1, "d"},
                     {10, 5, ""},
                     {99, 5, ""},
                     {4, 0, ""}};
  for (const auto& each : cases) {
    string buffer(each.Length, '?');
    ASSERT_EQ(file.Read(each.Position, buffer.data(), each.Length), std::ssize(each.Read)) << each.Position;
    EXPECT_EQ(buffer.substr(0, each.Read.size()), each.Read);
  }
  char byte = 0;
  EXPECT_EQ(file.Read(-1, &byte, 1), -1);
  EXPECT_FALSE(file.Write(-1, "x"));
  EXPECT_EQ(file.Size(), 10);

  EXPECT_TRUE(file.Write(12, "beyond"));  // the gap is zeros
  EXPECT_EQ(Content(a_).substr(9), string("d\0\0beyond", 9));
}

TEST_F(Files, SizeIsSet) {
  Put(a_, "0123456789");
  File file(a_, Access::ReadWrite);
  EXPECT_TRUE(file.SetSize(4));
  EXPECT_TRUE(file.SetSize(6));
  EXPECT_FALSE(file.SetSize(-1));
  EXPECT_TRUE(file.Flush());
  EXPECT_EQ(Content(a_), string("0123\0\0", 6));
  EXPECT_FALSE(File(a_, Access::Read).SetSize(0));
  EXPECT_FALSE(File(a_, Access::Read).Write(0, "x"));
  EXPECT_EQ(FileSize(a_), 6);
}

TEST_F(Files, TwoOpenFilesShareOnePath) {
  File one(a_, Access::ReadWrite), two(a_, Access::ReadWrite), reader(a_, Access::Read);
  EXPECT_TRUE(one.Write(0, "|A=1|"));
  EXPECT_TRUE(two.Write(two.Size(), "|B=2|"));
  EXPECT_EQ(Content(a_), "|A=1||B=2|");
  EXPECT_EQ(reader.Size(), 10);
  EXPECT_FALSE(DeleteFileA(a_));  // as it is open
  EXPECT_FALSE(MoveFileExA(a_, b_));
  Put(b_, "b");
  EXPECT_FALSE(MoveFileExA(b_, a_));
  for (File* file : {&one, &two, &reader}) file->Close();
  EXPECT_TRUE(MoveFileExA(b_, a_));
}

TEST_F(Files, ClosedFilesRefuseEverything) {
  File moved;
  {
    File file(a_, Access::ReadWrite);
    moved = std::move(file);
    EXPECT_FALSE(file.IsOpen());
  }
  EXPECT_TRUE(moved.Write(0, "x"));
  moved.Close();
  moved.Close();
  char byte = 0;
  EXPECT_FALSE(moved.IsOpen());
  EXPECT_EQ(moved.Size(), -1);
  EXPECT_EQ(moved.Read(0, &byte, 1), -1);
  EXPECT_FALSE(moved.Write(0, "y"));
  EXPECT_FALSE(moved.SetSize(0));
  EXPECT_FALSE(moved.Flush());
  EXPECT_EQ(Content(a_), "x");
  EXPECT_TRUE(DeleteFileA(a_));
}

TEST_F(Files, LengthsAndAttributesNeedNoOpenFile) {
  const string folder = directory_ / "Pasta";
  EXPECT_TRUE(CreateDirectoryA(folder));
  EXPECT_FALSE(CreateDirectoryA(folder + "\\"));                // stands already
  EXPECT_FALSE(CreateDirectoryA(directory_ / "nowhere\\sub"));  // no parent
  EXPECT_FALSE(CreateDirectoryA(directory_ / "cut" + zero + "x"));
  Put(a_, "12345");
  Put(b_, "");
  contract::SetAttributes(a_, AttributeReadOnly | AttributeHidden);
  contract::SetAttributes(b_, AttributeNormal);
  struct {
    string Path;
    std::optional<std::uint32_t> Attributes;
    std::optional<std::int64_t> Size;
  } const cases[] = {{a_, AttributeReadOnly | AttributeHidden, 5},
                     {directory_ / "A\xC7\xC3O.SMC", AttributeReadOnly | AttributeHidden, 5},  // in other case
                     {b_, 0, 0},
                     {folder, AttributeDirectory, {}},
                     {folder + "\\", AttributeDirectory, {}},
                     {directory_ / "pasta\\..\\PASTA", AttributeDirectory, {}},
                     {missing_, {}, {}},
                     {directory_ / "nowhere\\x", {}, {}},
                     {directory_ / "cut", {}, {}},
                     {directory_ / "*", {}, {}},
                     {"", {}, {}},
                     {a_ + zero, {}, {}}};
  for (const auto& each : cases) {
    std::optional<std::uint32_t> attributes = GetFileAttributesA(each.Path);
    if (attributes && each.Size)
      *attributes &= AttributeReadOnly | AttributeHidden;  // "archive" is each disk's own affair
    EXPECT_EQ(attributes, each.Attributes) << each.Path;
    EXPECT_EQ(FileSize(each.Path), each.Size) << each.Path;
  }
}

TEST_F(Files, AreDeletedUnlessReadOnly) {
  Put(a_, "a");
  Put(b_, "b");
  contract::SetAttributes(b_, AttributeReadOnly);
  EXPECT_FALSE(DeleteFileA(a_ + zero));
  EXPECT_TRUE(DeleteFileA(a_));
  EXPECT_FALSE(DeleteFileA(a_));
  EXPECT_FALSE(DeleteFileA(b_));
  EXPECT_FALSE(DeleteFileA(directory_.Path()));
  EXPECT_EQ(Content(a_), "(none)");
  EXPECT_EQ(Content(b_), "b");
}

// A row tells what becomes of the file b when the file a ("new") gets its place, by moving and by copying.
TEST_F(Files, MoveAndCopyReplace) {
  const string outside = directory_ / "nowhere\\x";
  struct {
    const char* What;
    std::uint32_t Attributes;  // of b before; 0: there is none
    string From, To;
    bool Succeeds;
    string After;  // b's content
  } const cases[] = {{"nothing there", 0, a_, b_, true, "new"},
                     {"over a file", AttributeArchive, a_, b_, true, "new"},
                     {"over a read-only file", AttributeReadOnly, a_, b_, false, "old"},
                     {"missing source", AttributeArchive, missing_, b_, false, "old"},
                     {"missing directory", AttributeArchive, a_, outside, false, "old"},
                     {"a directory's name", AttributeArchive, a_, directory_.Path(), false, "old"},
                     {"a name cut by a zero", AttributeArchive, a_, b_ + zero, false, "old"},
                     {"a source cut by a zero", AttributeArchive, a_ + zero, b_, false, "old"}};
  for (const auto operation : {MoveFileExA, CopyFileA}) {
    for (const auto& each : cases) {
      if (each.Attributes == AttributeReadOnly && !contract::ProtectsReadOnlyFiles()) continue;
      SCOPED_TRACE(string(operation == CopyFileA ? "copy: " : "move: ") + each.What);
      contract::SetAttributes(b_, AttributeNormal);
      DeleteFileA(b_);
      Put(a_, "new");
      if (each.Attributes != 0) {
        Put(b_, "old");
        contract::SetAttributes(b_, each.Attributes);
      }
      EXPECT_EQ(operation(each.From, each.To), each.Succeeds);
      EXPECT_EQ(Content(b_), each.After);
      const bool gone = each.Succeeds && operation == MoveFileExA;
      EXPECT_EQ(Content(a_), gone ? "(none)" : "new");
    }
  }
}

TEST_F(Files, CopiesAndMovedFilesHaveTheAttributesOfTheirSource) {
  Put(a_, "a");
  contract::SetAttributes(a_, AttributeReadOnly);
  EXPECT_TRUE(CopyFileA(a_, b_));
  EXPECT_EQ(GetFileAttributesA(b_).value_or(0) & AttributeReadOnly, AttributeReadOnly);
  EXPECT_TRUE(MoveFileExA(a_, missing_));
  EXPECT_EQ(GetFileAttributesA(missing_).value_or(0) & AttributeReadOnly, AttributeReadOnly);
}

TEST_F(Files, NamesInOtherCaseAreTheSameFile) {
  Put(a_, "new");
  Put(b_, "old");
  EXPECT_TRUE(MoveFileExA(a_, directory_ / "B.SMC"));
  EXPECT_EQ(Content(b_), "new");
  EXPECT_TRUE(MoveFileExA(b_, directory_ / "B.smc"));  // onto itself
  EXPECT_EQ(Content(b_), "new");
  EXPECT_EQ(ListDirectory(directory_.Path(), "*").size(), 1u);
}

TEST(Disks, TellTheirSpaceWhenTheyAreThere) {
  const string drive = ProgramDirectory().substr(0, 2);
  for (const string& root : {drive, drive + "\\"}) {
    const auto space = GetDiskFreeSpaceA(root);
    ASSERT_TRUE(space) << root;
    EXPECT_GT(std::uint64_t{space->SectorsPerCluster} * space->BytesPerSector, 0u);
    EXPECT_GE(space->TotalClusters, space->FreeClusters);
    EXPECT_GT(space->TotalClusters, 0u);
  }
  for (const string& root : {string("Q:"), string("q:\\"), drive + zero}) EXPECT_FALSE(GetDiskFreeSpaceA(root)) << root;
}

TEST(Disks, ADrivesDirectoryNeedsADisk) {
  const contract::FreshDirectory directory;
  const string root = ProgramDirectory().substr(0, 2) + "\\";
  EXPECT_TRUE(SetDriveDirectory(root));
  for (const string& none : {string("q:\\"), directory / "nowhere\\", root + zero, string()}) {
    EXPECT_FALSE(SetDriveDirectory(none)) << none;
  }
}

TEST(Disks, TheProgramHasADirectory) {
  const string directory = ProgramDirectory();
  EXPECT_FALSE(directory.ends_with('\\')) << directory;
  EXPECT_EQ(GetFileAttributesA(directory).value_or(0) & AttributeDirectory, AttributeDirectory);
}

}  // namespace
