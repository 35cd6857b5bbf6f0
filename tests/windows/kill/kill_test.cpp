// The real program is killed in the middle of what it does to files. scripts/kill runs this: it answers the lines
// "@started" and "@kill" with a look for the program's process and its end, and adds up the lines "@count".
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <functional>

#include "tests/windows/kill/moments.h"

namespace {

const std::string Floppy = "A:\\";
const Message Added = Of(Mensagem::JogoAdicionado), Saved = Of(Mensagem::ArquivoSalvo);

int Kills() {
  const char* const wanted = std::getenv("TOLVARIS_KILLS");
  return wanted == nullptr ? 1 : std::atoi(wanted);
}

// All files that can change, by their paths; those that are half written are told apart by their ending.
struct Found {
  Files Whole, Leftovers;
};

Found Look() {
  Found found;
  for (const std::string& directory : {Home, Outside, Floppy}) {
    for (const auto& [name, content] : FilesIn(directory)) {
      if (name.ends_with('\\') || name.find(".exe.") != std::string::npos) continue;  // what a stand-in left
      (name.ends_with(Leftover) ? found.Leftovers : found.Whole)[directory + name] = content;
    }
  }
  return found;
}

// As a disk has them on which nothing was written for two hours.
void Age(const Files& files) {
  for (const auto& [path, content] : files) {
    std::filesystem::last_write_time(path, std::filesystem::file_time_type::clock::now() - std::chrono::hours(2));
  }
}

std::string Join(const Files& files) {
  std::string names;
  for (const auto& [path, content] : files) names += " " + path;
  return names;
}

class Kill : public Installation {
 protected:
  // What a person does; the files, by path, that are there before and after.
  struct Operation {
    std::string Name;
    Files Before, After;
    std::function<void()> LeadUp, Press;  // up to the last press, and that
    std::function<bool()> HasEnded;       // quick to ask
    std::function<void()> Finish;         // looks whether the end is the right one, and closes what tells it
    bool StartCleans = true;              // else the same operation does, when it comes to the same directory
  };

  Kill() {
    DeleteFileA((Home + "Roms\\elan.ZIP").c_str());
    Put("Roms\\ELAN.zip", "jogo");
    Put("Imgs\\Élan.gif", Gif(RGB(1, 2, 3)));
    unchanged = Look().Whole;
  }

  void PressButton(int button) const { Window(GetDlgItem(FindMessage(*program).Handle(), button)).Click(); }
  // Whether a message that is titled like this one is there.
  bool Told(const Message& one) const {
    const Window message = FindMessage(*program);
    return message && message.Text() == one.Title;
  }

  // Files of the operation are old again, and nothing of a round before is left.
  void Prepare(const Operation& operation) {
    program.reset();
    for (const auto& [path, content] : Look().Leftovers) DeleteFileA(path.c_str());
    for (const auto& [path, content] : operation.After) DeleteFileA(path.c_str());
    for (const auto& [path, content] : operation.Before) PutFile(path, content);
  }

  void StartAndLeadUp(const Operation& operation) {
    Start();
    std::puts("@started");
    std::fflush(stdout);
    operation.LeadUp();
  }

  // The duration of the operation and of its writing, when nothing comes between.
  Moments Measure(const Operation& operation) {
    Moments moments(operation.After);
    Prepare(operation);
    StartAndLeadUp(operation);
    moments.Begin();
    operation.Press();
    moments.Watch(operation.HasEnded);
    operation.Finish();
    return moments;
  }

  // Whether the operation's end had been told when the program was killed.
  bool KillIt(const Operation& operation, Moments& moments, bool whileWriting) {
    moments.Begin();
    operation.Press();
    moments.AwaitOne(operation.HasEnded, whileWriting);
    const bool ended = operation.HasEnded();
    std::puts("@kill");
    std::fflush(stdout);
    EXPECT_SOON(program->HasEnded()) << "\nthe program was not killed";
    return ended;
  }

  // Each file is the old or the new one, whole, and no other has changed; how many are new.
  int ExpectOldOrNew(const Operation& operation, const Files& found) const {
    Files expected = unchanged;
    int changed = 0;
    for (const auto& [path, content] : operation.Before) expected[path] = content;
    for (const auto& [path, content] : operation.After) {
      if (found.contains(path) && found.at(path) == content) {
        expected[path] = content;
        ++changed;
      }
    }
    ExpectFiles(expected, found);
    return changed;
  }

  void ExpectNextStart(const Operation& operation) {
    StartAndListGames();
    if (operation.StartCleans) {
      EXPECT_SOON(Look().Leftovers.empty()) << "\na start leaves" << Join(Look().Leftovers);
    }
    operation.LeadUp();
    operation.Press();
    EXPECT_SOON(operation.HasEnded());
    operation.Finish();
    const Found found = Look();
    EXPECT_EQ(ExpectOldOrNew(operation, found.Whole), static_cast<int>(operation.After.size()));
    EXPECT_TRUE(found.Leftovers.empty()) << "\nleft for ever:" << Join(found.Leftovers);
  }

  void StartAndListGames() {
    Texts games = Games;
    if (std::filesystem::exists(Home + "Roms\\zz.smc")) games.emplace_back("zz");
    Start();
    EXPECT_SOON_EQ(games, Entries(window->List));
  }

  void Run(const Operation& operation) {
    for (const auto& [path, content] : operation.Before) unchanged.erase(path);
    Moments moments = Measure(operation);
    std::printf("%s: %s\n", operation.Name.c_str(), moments.Text().c_str());
    int middle = 0, left = 0;
    for (int round = 0; round < Kills(); ++round) {
      SCOPED_TRACE(operation.Name + ", kill " + std::to_string(round + 1));
      Prepare(operation);
      StartAndLeadUp(operation);
      const bool ended = KillIt(operation, moments, round % 4 != 0);
      const Found found = Look();
      const int changed = ExpectOldOrNew(operation, found.Whole);
      if (!ended && (changed > 0 || !found.Leftovers.empty())) ++middle;
      if (!found.Leftovers.empty()) ++left;
      Age(found.Leftovers);
      ExpectNextStart(operation);
    }
    std::printf("@count %s %d %d %d\n", operation.Name.c_str(), Kills(), middle, left);
    std::fflush(stdout);
  }

  Files unchanged;
  const FloppyDisk disk;
  std::optional<SaveManager> manager;
};

TEST_F(Kill, ImportOfARom) {
  const std::string path = Outside + "zz.smc", rom = Bytes(1, 12 << 20);
  Run({"import",
       {{path, rom}},
       {{path, rom}, {Home + "Roms\\zz.smc", rom}},
       [&] {
         Click(Import);
         FileDialog(*program).Type(path);
       },
       [] { PressKey(VK_RETURN); },
       [&] { return Told(Added); },
       [&] { EXPECT_EQ(Answer(IDOK), Added); }});
}

TEST_F(Kill, PackageOverAGame) {
  const std::string picture = Gif(RGB(9, 8, 7)) + Bytes(2, 4 << 20), rom = Bytes(3, (8 << 20) + 5);
  PutFile(Outside + "figura", picture);
  PutFile(Outside + "rom", rom);
  ASSERT_EQ(PackageFormat(Outside, "build jogo.tvk 'Élan' ELAN figura rom"), "");
  for (const char* piece : {"figura", "rom"}) DeleteFileA((Outside + piece).c_str());
  const std::string game = Home + "Roms\\ELAN.zip", preview = Home + "Imgs\\Élan.gif";
  unchanged[Outside + "jogo.tvk"] = ContentOf(Outside + "jogo.tvk");
  Run({"package",
       {{game, Bytes(4, 3 << 20)}, {preview, Gif(RGB(1, 2, 3))}},
       {{game, rom}, {preview, picture}},
       [&] {
         Choose(Import, Outside + "jogo.tvk");
         ASSERT_SOON(Told(Of(Mensagem::JogoJaExiste)));
       },
       [&] { PressButton(IDYES); },
       [&] { return Told(Added); },
       [&] { EXPECT_EQ(Answer(IDOK), Added); }});
}

TEST_F(Kill, ExportOverAFile) {
  const std::string path = Outside + "saiu.tvk", rom = Bytes(1, (12 << 20) + 5), picture = Gif(RGB(1, 2, 3));
  Put("Roms\\ELAN.zip", rom);
  unchanged[Home + "Roms\\ELAN.zip"] = rom;
  PutFile(Outside + "figura", picture);
  PutFile(Outside + "rom", rom);
  ASSERT_EQ(PackageFormat(Outside, "build saiu.tvk 'Élan' ELAN figura rom"), "");
  const std::string package = ContentOf(path);
  for (const char* piece : {"figura", "rom"}) DeleteFileA((Outside + piece).c_str());
  Run({"export",
       {{path, Bytes(2, 3 << 20)}},
       {{path, package}},
       [&] {
         Select("Élan");
         Choose(Export, path);
         ASSERT_SOON(Told(Of(Mensagem::ArquivoJaExiste)));
       },
       [&] { PressButton(IDYES); },
       [&] { return Told(Saved); },
       [&] { EXPECT_EQ(Answer(IDOK), Saved); },
       false});
}

TEST_F(Kill, CopyOfASaveOverAnother) {
  const std::string save = Bytes(1, 1'000'000), old = Bytes(2, 300'000), copy = Floppy + "ZEBRA.srm";
  Put("Saves\\ZEBRA.srm", save);
  unchanged[Home + "Saves\\ZEBRA.srm"] = save;
  Run({"save",
       {{copy, old}},
       {{copy, save}},
       [&] {
         PutFile(copy, old);  // the disk has no room for two of the new one
         Click(ManageSaves);
         manager.emplace(*program);
         ClickEntry(manager->Computer.List, "Zebra");
         EXPECT_SOON(manager->Copy.Visible());
         manager->Copy.Click();
         ASSERT_SOON(FindMessage(*program));
       },
       [&] { PressButton(IDYES); },
       [&] { return SizeOf(copy) == save.size(); },
       [&] {
         EXPECT_SOON(manager->Text() == "Salvamentos dos jogos");
         EXPECT_FALSE(FindMessage(*program));
       },
       false});
}

TEST_F(Kill, PlayThatChangesTheEmulatorsConfiguration) {
  std::string lines;
  while (lines.size() < 6 << 20) lines += "Option" + std::to_string(lines.size()) + " = 1\r\n";
  const std::string path = Home + "Emulador\\zsnesw.cfg";
  const auto configuration = [&](const std::string& saves, const std::string& games) {
    return lines + "SaveDirectory = " + saves + "\r\nGameDirectory = " + games + "\r\nb=2";
  };
  Run({"play",
       {{path, configuration("D:\\", "D:\\")}},
       {{path, configuration(Home + "Saves", Home + "Roms")}},
       [&] { Select("Zebra"); },
       [&] { window->Play.Click(); },
       [&] { return SizeOf(Emulator + ".call") > 0; },
       [&] { ExpectPlayed("ZEBRA.SMC"); }});
}

}  // namespace
