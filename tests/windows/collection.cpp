#include "tests/windows/collection.h"

Collection::Collection() {
  installation.Configure();
  installation.PutGames();
  installation.Put("Fora\\leia.txt", "texto");
}

void Collection::Start() {
  program.emplace(installation.CommandLine(), installation.Directory);
  window.emplace(*program);
}

void Collection::Select(const std::string& game) const {
  ClickEntry(window->List, game);
  for (const Command command : {Export, Delete}) EXPECT_SOON(window->Pictures[command].Enabled());
}

driver::FileDialog Collection::Press(Command command) const {
  window->Pictures[command].Click();
  return driver::FileDialog(*program);
}

void Collection::Choose(Command command, const std::string& path) const {
  const driver::FileDialog dialog = Press(command);
  dialog.Type(path);
  dialog.Press(IDOK);
}

void Collection::ExpectQuietEnd() const {
  EXPECT_SOON(window->Pictures[Import].Enabled());
  EXPECT_FALSE(driver::FindMessage(*program));
  for (const Command command : {Export, Delete}) EXPECT_FALSE(window->Pictures[command].Enabled());
}

std::string Collection::Selected() const {
  const int selected = SelectedEntry(window->List);
  const Texts entries = Entries(window->List);
  return selected >= 0 && selected < static_cast<int>(entries.size()) ? entries[static_cast<size_t>(selected)] : "";
}

Files Collection::Kept() const {
  Files kept = {{"tolvaris.dat", installation.Content("tolvaris.dat")}};
  for (const std::string directory : {"Roms\\", "Imgs\\"}) {
    for (const auto& [name, content] : FilesIn(installation.Directory + directory)) kept[directory + name] = content;
  }
  return kept;
}

// Contents are too long to be shown.
void Collection::ExpectKept(const Files& expected) const {
  const Files kept = Kept();
  for (const auto& [name, content] : kept) EXPECT_TRUE(expected.contains(name)) << name << " should not be there";
  for (const auto& [name, content] : expected) {
    EXPECT_TRUE(kept.contains(name) && kept.at(name) == content) << name << " is missing or has other bytes";
  }
}

std::string Pacote(const std::string& arguments) {
  // The output takes its name when it is complete: that shows the end.
  const std::string output = "C:\\Ensaio\\pacote.txt";
  const std::string hostOutput = "'" + HostPath(output) + "'";
  driver::StartOnHost("/bin/sh -c \"python3 '" PACOTE_PY "' " + arguments + " >" + hostOutput + ".part 2>&1; mv " +
                      hostOutput + ".part " + hostOutput + "\"");
  EXPECT_SOON(GetFileAttributesA(output.c_str()) != INVALID_FILE_ATTRIBUTES) << arguments;
  const std::string utf8 = ContentOf(output);
  DeleteFileA(output.c_str());
  std::wstring wide(utf8.size(), L'\0');
  wide.resize(static_cast<size_t>(MultiByteToWideChar(CP_UTF8, 0, utf8.data(), static_cast<int>(utf8.size()),
                                                      wide.data(), static_cast<int>(wide.size()))));
  std::string text(wide.size(), '\0');
  WideCharToMultiByte(CP_ACP, 0, wide.data(), static_cast<int>(wide.size()), text.data(), static_cast<int>(text.size()),
                      nullptr, nullptr);
  return text;
}
