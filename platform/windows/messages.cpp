#include "platform/messages.h"

#include "platform/windows/events.h"
#include "platform/windows/wide.h"
#include "platform/windows/window.h"

namespace platform {
namespace {

UINT StyleOf(Buttons buttons) {
  switch (buttons) {
    case Buttons::YesNoCancel:
      return MB_YESNOCANCEL;
    case Buttons::RetryCancel:
      return MB_RETRYCANCEL;
    default:
      return MB_OK;
  }
}

UINT StyleOf(Icon icon) {
  switch (icon) {
    case Icon::Critical:
      return MB_ICONERROR;
    case Icon::Question:
      return MB_ICONQUESTION;
    case Icon::Exclamation:
      return MB_ICONWARNING;
    default:
      return MB_ICONINFORMATION;
  }
}

}  // namespace

Answer MessageBoxA(const std::string& text, const std::string& title, Buttons buttons, Icon icon) {
  const HWND owner = OwnerForModal();
  const OwnEventLoop loop;
  const UINT modality = owner == nullptr ? MB_TASKMODAL : MB_APPLMODAL;
  switch (::MessageBoxW(owner, ToShown(text).c_str(), ToShown(title).c_str(),
                        StyleOf(buttons) | StyleOf(icon) | modality)) {
    case IDYES:
      return Answer::Yes;
    case IDNO:
      return Answer::No;
    case IDRETRY:
      return Answer::Retry;
    case IDOK:
      return Answer::Ok;
    default:
      return buttons == Buttons::Ok ? Answer::Ok : Answer::Cancel;
  }
}

}  // namespace platform
