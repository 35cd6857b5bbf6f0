#include "platform/messages.h"

#include <string_view>
#include <utility>

#include "platform/simulated/machine.h"
#include "platform/text.h"

namespace platform {
namespace {

using simulated::TheMachine;

bool Offers(Buttons buttons, Answer answer) {
  switch (answer) {
    case Answer::Ok:
      return buttons == Buttons::Ok;
    case Answer::Cancel:
      return buttons != Buttons::Ok;
    case Answer::Retry:
      return buttons == Buttons::RetryCancel;
    default:
      return buttons == Buttons::YesNoCancel;
  }
}

Answer AnswerOfClosing(Buttons buttons) { return buttons == Buttons::Ok ? Answer::Ok : Answer::Cancel; }

// A path may be offered as well.
bool CanNameFile(const std::string& offered) {
  constexpr std::string_view never = "<>\"|?*";
  for (std::size_t i = 0; i < offered.size(); ++i) {
    const bool refused = static_cast<unsigned char>(offered[i]) < ' ' || never.find(offered[i]) != std::string::npos ||
                         (offered[i] == ':' && i != 1);
    if (refused && CharacterBeginsAt(offered, i)) return false;
  }
  return true;
}

bool ShowFileDialog(OpenFileName& request) {
  TheMachine().Dialogs.push_back(request);
  if (!CanNameFile(request.File)) return false;
  if (TheMachine().DialogPaths.empty()) return false;
  std::string path = std::move(TheMachine().DialogPaths.front());
  TheMachine().DialogPaths.pop_front();
  if (path.empty() || path.size() + 1 > request.FileSize) return false;
  request.File = std::move(path);
  return true;
}

}  // namespace

Answer MessageBoxA(const std::string& text, const std::string& title, Buttons buttons, Icon icon) {
  TheMachine().Messages.push_back({text, title, buttons, icon});
  if (TheMachine().Answers.empty()) return AnswerOfClosing(buttons);
  const simulated::QueuedAnswer answer = std::move(TheMachine().Answers.front());
  TheMachine().Answers.pop_front();
  const simulated::ModalTurn turn(nullptr);
  if (answer.Meanwhile) answer.Meanwhile();
  return Offers(buttons, answer.Given) ? answer.Given : AnswerOfClosing(buttons);
}

bool GetOpenFileNameA(OpenFileName& request) { return ShowFileDialog(request); }

bool GetSaveFileNameA(OpenFileName& request) { return ShowFileDialog(request); }

}  // namespace platform

namespace platform::simulated {

void QueueAnswer(Answer answer) { QueueAnswer(answer, nullptr); }

void QueueAnswer(Answer answer, std::function<void()> meanwhile) {
  TheMachine().Answers.push_back({answer, std::move(meanwhile)});
}

const std::vector<ShownMessage>& ShownMessages() { return TheMachine().Messages; }

void ForgetMessages() { TheMachine().Messages.clear(); }

void QueueFileDialog(const std::string& path) { TheMachine().DialogPaths.push_back(path); }

const std::vector<OpenFileName>& ShownFileDialogs() { return TheMachine().Dialogs; }

}  // namespace platform::simulated
