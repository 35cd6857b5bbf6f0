#include "platform/windows/accessibility.h"

// clang-format off
#include <windows.h>
#include <initguid.h>
#include <objbase.h>
#include <oleacc.h>
// clang-format on

#include <array>

#include "platform/windows/com.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

// Made once, when the first reader asks, and alive until the process ends; null when Windows has none.
IAccPropServices* Services() {
  static auto* const services =
      static_cast<IAccPropServices*>(CreateObject(CLSID_AccPropServices, IID_IAccPropServices));
  return services;
}

constexpr auto Object = static_cast<DWORD>(OBJID_CLIENT), Itself = DWORD{CHILDID_SELF};

}  // namespace

void TellName(ControlState& control) {
  if (control.AccessibleName.empty() || control.NameIsTold) return;
  control.NameIsTold = true;  // also a refusal stays
  if (IAccPropServices* const services = Services()) {
    services->SetHwndPropStr(control.Handle, Object, Itself, PROPID_ACC_NAME, ToShown(control.AccessibleName).c_str());
  }
}

void ForgetName(const ControlState& control) {
  if (!control.NameIsTold) return;
  std::array<MSAAPROPID, 1> name = {PROPID_ACC_NAME};
  if (IAccPropServices* const services = Services()) {
    services->ClearHwndProps(control.Handle, Object, Itself, name.data(), static_cast<int>(name.size()));
  }
}

}  // namespace platform
