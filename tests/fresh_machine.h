// What the tests of the program's logic share: a fresh machine in memory, what its person has seen, and an operation
// with each of its platform calls failing in turn.
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/gravacao.h"
#include "support/mod_Globais.h"
#include "tests/messages.h"

using namespace platform::simulated;
using namespace std::string_literals;
using platform::Answer;
using Texts = std::vector<std::string>;

// A test on a fresh machine, with the program's texts as they are there.
struct FreshMachine : testing::Test {
  FreshMachine() { Renew(); }
  ~FreshMachine() override { EXPECT_EQ(OpenRegistryHandles(), 0U); }

  static void Renew() {
    Reset();
    DirPrograma = "C:\\Tolvaris\\";
    ArquivoIdioma.clear();
  }
};

// A message as "title, buttons, icon: text".
inline std::string InOneText(const ShownMessage& message) {
  constexpr const char* buttons[] = {"OK", "Yes/No/Cancel", "Retry/Cancel"};
  constexpr const char* icons[] = {"critical", "question", "exclamation", "information"};
  const std::string button = buttons[static_cast<int>(message.Choice)], icon = icons[static_cast<int>(message.Symbol)];
  return message.Title + ", " + button + ", " + icon + ": " + message.Text;
}

// The messages shown since the last call.
inline Texts TakeMessages() {
  Texts texts;
  for (const ShownMessage& each : ShownMessages()) texts.push_back(InOneText(each));
  ForgetMessages();
  return texts;
}

// The message of this name, as TakeMessages tells it.
inline std::string Told(Mensagem which, const std::string& value = "") {
  return InOneText({TextOf(which, value), TitleOf(which), RowOf(which).Botoes, RowOf(which).Icone});
}

// The entries of a list, with a bar behind each.
inline std::string EntriesOf(const platform::ListBox& list) {
  std::string entries;
  for (int i = 0; i < list.Count(); ++i) entries += list.Text(i) + "|";
  return entries;
}

// The captions and tool tips of a window and its controls, between bars.
inline std::string TextsOf(const platform::Window& window) {
  std::string texts = window.Caption();
  for (const platform::Control* each : ControlsOf(window)) texts += "|" + each->Caption() + each->ToolTip();
  return texts;
}

// Once the hour is over in which another program may still be writing: deletes what was left half written in these
// directories, and says what is left all the same.
inline Texts Leftovers(const Texts& directories) {
  PassTime(3601);
  for (const std::string& directory : directories) ApagarRestos(directory);
  Texts leftovers = AllFiles();
  std::erase_if(leftovers, [](const std::string& file) { return !file.ends_with(".novo~"); });
  return leftovers;
}

// On a fresh machine each time: prepares, runs the operation with the n-th platform call failing in this way, and looks
// at what is left; n = 1, 2, 3 ... until no call is left to fail, which is the last look. The returned number of faults
// tells that there were some.
template <typename Prepare, typename Operate, typename Check>
int WithEachFault(Fault fault, Prepare prepare, Operate operate, Check check) {
  for (int n = 1; n < 1000; ++n) {
    FreshMachine::Renew();
    prepare();
    FailCall(n, fault);
    operate();
    const bool failed = CallFailed();
    FailCall(0);
    constexpr const char* how[] = {" failed", " and all later ones failed", " met a power cut"};
    SCOPED_TRACE(testing::Message() << "platform call " << n << (failed ? how[static_cast<int>(fault)] : " is none"));
    check();
    if (!failed || testing::Test::HasFatalFailure()) return n - 1;
  }
  ADD_FAILURE() << "the faults never end";
  return 0;
}

// The same with each kind of failure; the number of those that failed once.
template <typename Prepare, typename Operate, typename Check>
int WithEachFault(Prepare prepare, Operate operate, Check check) {
  WithEachFault(Fault::FromThenOn, prepare, operate, check);
  WithEachFault(Fault::PowerCut, prepare, operate, check);
  return WithEachFault(Fault::Once, prepare, operate, check);
}
