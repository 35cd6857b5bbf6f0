// The real program over 200 games with pictures of 2000 x 2000: from a press of the arrow key until the next game's
// picture is on the screen; in turn with decoding such a picture alone. It lies in the directory of tolvaris.exe.
// clang-format off
#include <windows.h>
#include <initguid.h>
#include <objbase.h>
#include <wincodec.h>
// clang-format on

#include <cstdint>
#include <fstream>
#include <string>
#include <vector>

#include "benchmarks/median.h"

namespace {

using namespace benchmarks;

constexpr int Games = 200;
constexpr UINT Side = 2000;
constexpr int Brightnesses[] = {200, 230};  // by turns; the program's own picture has neither
constexpr double Limit = 30'000;            // milliseconds

std::string Bytes(std::initializer_list<int> values) { return {values.begin(), values.end()}; }

std::string Segment(int kind, const std::string& data) {
  const int length = static_cast<int>(data.size()) + 2;
  return Bytes({0xFF, kind, length >> 8, length & 0xFF}) + data;
}

// All of one grey, from 192 to 255. The first block of 8 x 8 pixels says it: the code 10, seven bits, and 0 for the end
// of the block. Each block that follows is like the one before: two codes 0.
std::string GreyJpeg(int brightness) {
  const int first = 0x8000 | (brightness - 128) << 7;
  const std::string differences = Bytes({0x00, 1, 1}) + std::string(14, '\0') + Bytes({0, 7});
  const std::string others = Bytes({0x10, 1}) + std::string(15, '\0') + Bytes({0});
  return Bytes({0xFF, 0xD8}) + Segment(0xDB, Bytes({0}) + std::string(64, '\x08')) +
         Segment(0xC0, Bytes({8, Side >> 8, Side & 0xFF, Side >> 8, Side & 0xFF, 1, 1, 0x11, 0})) +
         Segment(0xC4, differences) + Segment(0xC4, others) + Segment(0xDA, Bytes({1, 1, 0, 0, 63, 0})) +
         Bytes({first >> 8, first & 0xFF}) + std::string(Side / 8 * Side / 8 / 4, '\0') + Bytes({0xFF, 0xD9});
}

bool Write(const std::string& path, const std::string& content) {
  std::ofstream file(path, std::ios::binary);
  file << content;
  file.close();
  return file.good();
}

// A directory of its own, with the program in it.
bool Install(const std::string& directory) {
  for (const char* each : {"", "Roms", "Imgs"}) ::CreateDirectoryA((directory + each).c_str(), nullptr);
  for (int game = 0; game < Games; ++game) {
    const std::string name = "jogo " + std::to_string(1000 + game);
    if (!Write(directory + "Roms\\" + name + ".smc", "rom")) return false;
    if (!Write(directory + "Imgs\\" + name + ".jpg", GreyJpeg(Brightnesses[game % 2]))) return false;
  }
  return ::CopyFileA("D:\\tolvaris.exe", (directory + "tolvaris.exe").c_str(), FALSE) != FALSE;
}

template <typename Condition>
bool Eventually(const Condition& holds) {
  for (const Stopwatch watch; watch.Milliseconds() < Limit; ::Sleep(1)) {
    if (holds()) return true;
  }
  return false;
}

// In the middle of the preview, as the screen shows it.
int BrightnessOfPreview(HWND window) {
  POINT place = {356, 103};
  ::ClientToScreen(window, &place);
  const HDC screen = ::GetDC(nullptr);
  const COLORREF colour = ::GetPixel(screen, place.x, place.y);
  ::ReleaseDC(nullptr, screen);
  return GetRValue(colour);
}

// Milliseconds until the next game's picture stands; below zero when it does not come.
double PressArrow(HWND window, HWND list, int brightness) {
  const Stopwatch watch;
  ::PostMessageA(list, WM_KEYDOWN, VK_DOWN, 1);
  return Eventually([&] { return BrightnessOfPreview(window) == brightness; }) ? watch.Milliseconds() : -1;
}

double Decode(IWICImagingFactory* factory, std::string content) {
  const Stopwatch watch;
  IWICStream* stream = nullptr;
  IWICBitmapDecoder* decoder = nullptr;
  IWICBitmapFrameDecode* frame = nullptr;
  IWICFormatConverter* converter = nullptr;
  std::vector<std::uint32_t> pixels(std::size_t{Side} * Side);
  const bool done =
      SUCCEEDED(factory->CreateStream(&stream)) &&
      SUCCEEDED(
          stream->InitializeFromMemory(reinterpret_cast<BYTE*>(content.data()), static_cast<DWORD>(content.size()))) &&
      SUCCEEDED(factory->CreateDecoderFromStream(stream, nullptr, WICDecodeMetadataCacheOnDemand, &decoder)) &&
      SUCCEEDED(decoder->GetFrame(0, &frame)) && SUCCEEDED(factory->CreateFormatConverter(&converter)) &&
      SUCCEEDED(converter->Initialize(frame, GUID_WICPixelFormat32bppBGR, WICBitmapDitherTypeNone, nullptr, 0,
                                      WICBitmapPaletteTypeCustom)) &&
      SUCCEEDED(converter->CopyPixels(nullptr, 4 * Side, static_cast<UINT>(4 * pixels.size()),
                                      reinterpret_cast<BYTE*>(pixels.data())));
  const double time = watch.Milliseconds();
  for (IUnknown* each : std::initializer_list<IUnknown*>{converter, frame, decoder, stream}) {
    if (each != nullptr) each->Release();
  }
  return done ? time : -1;
}

bool Measure(HWND window, IWICImagingFactory* factory) {
  const HWND list = ::FindWindowExA(window, nullptr, "LISTBOX", nullptr);
  if (!Eventually([&] { return ::SendMessageA(list, LB_GETCOUNT, 0, 0) == Games; })) return false;
  ::SendMessageA(list, LB_SETCURSEL, 0, 0);
  std::vector<double> pressed, decoded;
  for (int game = 1; game < Games; ++game) {
    pressed.push_back(PressArrow(window, list, Brightnesses[game % 2]));
    decoded.push_back(Decode(factory, GreyJpeg(Brightnesses[game % 2])));
    if (pressed.back() < 0 || decoded.back() < 0) return false;
  }
  Tell("next game and its picture", pressed);
  Tell("decoding of a picture", decoded);
  return true;
}

}  // namespace

int main() {
  const std::string directory = "D:\\Figuras\\";
  IWICImagingFactory* factory = nullptr;
  ::CoInitializeEx(nullptr, COINIT_APARTMENTTHREADED);
  if (!Install(directory) || FAILED(::CoCreateInstance(CLSID_WICImagingFactory, nullptr, CLSCTX_INPROC_SERVER,
                                                       IID_IWICImagingFactory, reinterpret_cast<LPVOID*>(&factory)))) {
    return 1;
  }
  STARTUPINFOA startup{};
  startup.cb = sizeof startup;
  PROCESS_INFORMATION process{};
  if (!::CreateProcessA((directory + "tolvaris.exe").c_str(), nullptr, nullptr, nullptr, FALSE, 0, nullptr, nullptr,
                        &startup, &process)) {
    return 1;
  }
  HWND window = nullptr;
  const bool measured = Eventually([&] {
                          return (window = ::FindWindowA(nullptr, "Tolvaris")) != nullptr && ::IsWindowVisible(window);
                        }) &&
                        Measure(window, factory);
  ::PostMessageA(window, WM_CLOSE, 0, 0);
  if (::WaitForSingleObject(process.hProcess, static_cast<DWORD>(Limit)) != WAIT_OBJECT_0) {
    ::TerminateProcess(process.hProcess, 1);
  }
  return measured ? 0 : 1;
}
