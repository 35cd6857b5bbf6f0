// Runs the tests; each that fails leaves a picture of the screen in failures/ below the current directory.
#include <gtest/gtest.h>
#include <windows.h>

#include <fstream>
#include <string>
#include <vector>

namespace {

struct Bitmap {
  BITMAPINFOHEADER Header{};
  std::vector<char> Pixels;
};

Bitmap Screen() {
  Bitmap bitmap;
  BITMAPINFOHEADER& header = bitmap.Header;
  header.biSize = sizeof header;
  header.biWidth = GetSystemMetrics(SM_CXSCREEN);
  header.biHeight = GetSystemMetrics(SM_CYSCREEN);
  header.biPlanes = 1;
  header.biBitCount = 24;
  bitmap.Pixels.resize(static_cast<size_t>((header.biWidth * 3 + 3) / 4 * 4 * header.biHeight));
  const HDC screen = GetDC(nullptr);
  const HDC copy = CreateCompatibleDC(screen);
  const HBITMAP seen = CreateCompatibleBitmap(screen, header.biWidth, header.biHeight);
  const HGDIOBJ before = SelectObject(copy, seen);
  BitBlt(copy, 0, 0, header.biWidth, header.biHeight, screen, 0, 0, SRCCOPY);
  SelectObject(copy, before);
  GetDIBits(copy, seen, 0, static_cast<UINT>(header.biHeight), bitmap.Pixels.data(),
            reinterpret_cast<BITMAPINFO*>(&header), DIB_RGB_COLORS);
  DeleteObject(seen);
  DeleteDC(copy);
  ReleaseDC(nullptr, screen);
  return bitmap;
}

void Save(const Bitmap& bitmap, const std::string& path) {
  BITMAPFILEHEADER start{};
  start.bfType = 0x4D42;  // "BM"
  start.bfOffBits = sizeof start + sizeof bitmap.Header;
  start.bfSize = start.bfOffBits + static_cast<DWORD>(bitmap.Pixels.size());
  std::ofstream file(path, std::ios::binary);
  file.write(reinterpret_cast<const char*>(&start), sizeof start);
  file.write(reinterpret_cast<const char*>(&bitmap.Header), sizeof bitmap.Header);
  file.write(bitmap.Pixels.data(), static_cast<std::streamsize>(bitmap.Pixels.size()));
}

class ScreenOfFailure : public testing::EmptyTestEventListener {
  // Called at the moment of the failure, while the program's windows still stand.
  void OnTestPartResult(const testing::TestPartResult& result) override {
    if (!result.failed()) return;
    const testing::TestInfo* test = testing::UnitTest::GetInstance()->current_test_info();
    CreateDirectoryA("failures", nullptr);
    Save(Screen(), std::string("failures/") + test->test_suite_name() + "." + test->name() + ".bmp");
  }
};

}  // namespace

int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  testing::UnitTest::GetInstance()->listeners().Append(new ScreenOfFailure);  // gtest owns it
  return RUN_ALL_TESTS();
}
