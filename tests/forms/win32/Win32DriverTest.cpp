#include "forms/win32/Win32Driver.h"
#include "forms/suite/DesktopSuite.h"

namespace quendra::forms::win32 {
namespace {

std::unique_ptr<DesktopDriver> MakeDriver() { return std::make_unique<Win32Driver>(); }

} // namespace
} // namespace quendra::forms::win32

namespace quendra::forms {
INSTANTIATE_TEST_SUITE_P(Win32, DesktopSuite, testing::Values(&win32::MakeDriver));
} // namespace quendra::forms
