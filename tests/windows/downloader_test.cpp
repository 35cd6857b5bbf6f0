// Handing the window over to the downloader and taking it back.
#include "tests/windows/installation.h"

namespace {

const std::string DownloaderPath = Home + "tolvarisdownload.exe";
constexpr ULONGLONG Soon = 2500;  // milliseconds: the program looks once a second, and this machine may be busy

class Downloader : public Installation {};

std::string Number(const Window& window) {
  return std::to_string(static_cast<int>(reinterpret_cast<intptr_t>(window.Handle())));
}

TEST_F(Downloader, GivesTheWindowBackWithTheGamesThatItBrought) {
  PutStandIn("tolvarisdownload.exe");
  Set("LRom", "Zebra");
  Start();
  const HANDLE wake = CreateEventA(nullptr, TRUE, FALSE, "TolvarisDownload");
  Click(Download);
  EXPECT_EQ(NextCall(DownloaderPath),
            (Call{DownloaderPath + " " + Number(*window) + "@" + Number(window->List), "C:\\Ensaio"}));
  EXPECT_FALSE(window->Enabled());
  EXPECT_EQ(window->Text(), "...");
  EXPECT_EQ(Selected(), "");
  // To no effect. Only once it has been handled may the window be given back.
  SendMessageTimeoutW(window->Handle(), WM_SYSCOMMAND, SC_CLOSE, 0, SMTO_NORMAL, Limit, nullptr);

  SetEvent(wake);
  const ULONGLONG woken = GetTickCount64();
  EXPECT_SOON_EQ((Texts{"abelha", "Água Viva", "Corrida das Nuvens", "Élan", "Nave Nova", "Zebra"}),
                 Entries(window->List));
  EXPECT_SOON(window->Enabled());
  EXPECT_SOON(window->Play.Enabled());
  EXPECT_SOON_EQ(std::string("Tolvaris"), window->Text());
  EXPECT_EQ(Selected(), "Zebra");
  EXPECT_LT(GetTickCount64() - woken, Soon);
  CloseHandle(wake);
}

}  // namespace
