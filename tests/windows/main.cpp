// Runs the tests; each that fails leaves a picture of the screen in failures/ below the current directory.
#include <gtest/gtest.h>

#include "tests/windows/driver/window.h"
#include "tests/windows/files.h"

namespace {

class ScreenOfFailure : public testing::EmptyTestEventListener {
  // Called at the moment of the failure, while the program's windows still stand.
  void OnTestPartResult(const testing::TestPartResult& result) override {
    const testing::TestInfo* test = testing::UnitTest::GetInstance()->current_test_info();
    const std::string path = std::string("failures\\") + test->test_suite_name() + "." + test->name() + ".bmp";
    if (result.failed()) PutFile(path, Window(GetDesktopWindow()).Picture());
  }
};

}  // namespace

int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  testing::UnitTest::GetInstance()->listeners().Append(new ScreenOfFailure);  // gtest owns it
  return RUN_ALL_TESTS();
}
