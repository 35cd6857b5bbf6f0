#include <algorithm>

#include "platform/screen.h"
#include "platform/text.h"
#include "tests/contract/hand.h"

namespace {

using namespace contract;

using Texts = std::vector<string>;

constexpr const char* Untouched = "| row -1, unchecked, choice 0";

class Controls : public AllControls {};

Texts TextsOf(const ListBox& list) {
  Texts texts;
  for (int i = 0; i < list.Count(); ++i) texts.push_back(list.Text(i));
  return texts;
}

TEST_F(Controls, SortedListKeepsTheOrderOfTheLanguageAndFindsWholeTextsWithoutCase) {
  const Texts order = {"10", "2", "abelha", "Água"_ansi, "ALFA", "maca", "maçã"_ansi, "Macaco", "Zebra"};
  const Texts added(order.rbegin(), order.rend());
  for (const auto kind : {ListBox::Order::AsAdded, ListBox::Order::Sorted}) {
    const Texts& expected = kind == ListBox::Order::Sorted ? order : added;
    ListBox box(window, {100, 1700, 1500, 1000}, kind);
    for (const string& text : added) box.Add(text);
    EXPECT_EQ(TextsOf(box), expected);
    box.Fill({added.begin(), added.end() - 1});
    box.Add(added.back());
    EXPECT_EQ(TextsOf(box), expected);
    EXPECT_EQ(box.Text(-1) + box.Text(box.Count()), "");
    EXPECT_EQ(box.Text(box.FindExact("áGUA"_ansi)), "Água"_ansi);
    for (const char* text : {"Agua", "mac", "maca ", ""}) EXPECT_EQ(box.FindExact(text), -1) << text;
  }
}

TEST_F(Controls, WindowsAreCentredOnThePrimaryMonitor) {
  const Bounds primary = {0, 0, ScreenWidth(), ScreenHeight()};
  const std::vector<Bounds> monitors = Monitors();
  EXPECT_NE(std::find(monitors.begin(), monitors.end(), primary), monitors.end());
  EXPECT_NEAR(2 * window.Left() + window.Width(), primary.Width, 60);
  EXPECT_NEAR(2 * window.Top() + window.Height(), primary.Height, 60);
}

TEST_F(Controls, SelectionInCodeIsSilentAndNeverGuesses) {
  const std::pair<int, int> cases[] = {{1, 1}, {2, 2}, {3, 2}, {-1, -1}, {-2, -1}, {0, 0}};
  for (const auto& [select, selected] : cases) {
    list.Select(select);
    EXPECT_EQ(list.Selected(), selected) << select;
  }
  list.Add("0");  // comes before the selected one
  combo.Select(1);
  check.SetValue(1);
  RunPendingEvents();
  EXPECT_EQ(Seen(), "| row 1, checked, choice 1");
  list.Clear();
  RunPendingEvents();
  EXPECT_EQ(Seen(), "| row -1, checked, choice 1");
  EXPECT_EQ(list.Count(), 0);
}

TEST_F(Controls, HandActsOnWhatTakesInputOnly) {
  const auto act = [this] {
    Choose(list, 1);
    Click(button);
    Click(image);
    Click(check);
    return Seen();
  };
  for (const auto change : {&Control::Enable, &Control::Show}) {
    for (Control* control : inputs) (control->*change)(false);
    EXPECT_EQ(list.Enabled(), change == &Control::Show);
    EXPECT_EQ(list.Visible(), change == &Control::Enable);
    EXPECT_EQ(act(), Untouched);
    for (Control* control : inputs) (control->*change)(true);
  }
  window.Enable(false);
  EXPECT_EQ(act(), Untouched);
  UseCloseBox(window);
  EXPECT_FALSE(window.IsClosed());
  EXPECT_FALSE(window.Enabled());
  window.Enable(true);
  EXPECT_EQ(act(), "list button image | row 1, checked, choice 0");
  EXPECT_EQ(act(), "list button image | row 1, unchecked, choice 0");
}

TEST_F(Controls, AHeldKeyIsToldOnceAndGoesOnMovingTheSelection) {
  constexpr int down = 40, enter = 13;
  list.OnKeyDown = [this](int key) { clicks += std::to_string(key) + " "; };
  list.Select(0);
  HoldKey(list, down, 1);
  EXPECT_EQ(Seen(), "40 list list | row 2, unchecked, choice 0");
  for (int press = 0; press < 2; ++press) {
    HoldKey(list, enter, 20);
    EXPECT_EQ(Seen(), "13 | row 2, unchecked, choice 0");
  }
}

TEST_F(Controls, ClosingRunsUnloadOnceAndLeavesTheLastAnswers) {
  window.OnUnload = [&] {
    clicks += "unload ";
    window.Close();
    EXPECT_FALSE(window.IsClosed());
    EXPECT_EQ(list.Count(), 3);
    throw 1;  // dropped at the edge of the handler
  };
  list.Select(1);
  check.SetValue(1);
  UseCloseBox(window);
  window.Close();
  EXPECT_TRUE(window.IsClosed());
  list.Select(0);
  list.Add("D");
  list.Clear();
  check.SetValue(0);
  for (Control* control : inputs) {
    control->SetCaption("Outro");
    control->Enable(false);
    control->Show(false);
    EXPECT_TRUE(control->Enabled());
    EXPECT_TRUE(control->Visible());
  }
  window.Show();
  window.ShowModal();
  EXPECT_EQ(Seen(), "unload | row 1, checked, choice 0");
  EXPECT_EQ(TextsOf(list), (Texts{"A", "B", "C"}));
  EXPECT_EQ(button.Caption(), "&Jogar");
}

TEST_F(Controls, ModalWindowTakesAllInputUntilItIsClosed) {
  Window modal({.Caption = "Modal", .ClientWidth = 3000, .ClientHeight = 3000});
  Button inside(modal, {100, 100, 1000, 400}, "Dentro");
  inside.OnClick = [&] { clicks += "inside "; };
  QueueModal([&] {
    Click(button);
    UseCloseBox(window);
    Click(inside);
    UseCloseBox(modal);
  });
  modal.ShowModal();
  EXPECT_TRUE(modal.IsClosed());
  EXPECT_TRUE(window.Enabled());
  EXPECT_FALSE(window.IsClosed());
  EXPECT_EQ(Seen(), "inside | row -1, unchecked, choice 0");
}

// The first window made is the main one. It is closed while events run inside a handler, deep in the loop.
TEST_F(Controls, PendingEventsRunInOrderAndTheLoopEndsWithTheMainWindow) {
  for (const char* name : {"a", "b", "c"}) QueueEvent([this, name] { clicks += name; });
  for (int again = 0; again < 2; ++again) RunPendingEvents();
  Window second({.Caption = "Segunda", .ClientWidth = 3000, .ClientHeight = 3000});
  QueueEvent([&] {
    second.Close();
    QueueEvent([&] { window.Close(); });
    RunPendingEvents();
    clicks += window.IsClosed() ? " closed" : " open";
    RunPendingEvents();
  });
  RunEventLoop();
  EXPECT_EQ(clicks, "abc closed");
}

TEST_F(Controls, PendingEventsBringNoOthersBelowThemButInAModalWindow) {
  Window modal({.Caption = "Modal", .ClientWidth = 3000, .ClientHeight = 3000});
  QueueEvent([&] {
    QueueEvent([&] { clicks += "b"; });
    RunPendingEvents();
    clicks += "a";
    QueueModal([&] {
      QueueEvent([&] { clicks += "c"; });
      RunPendingEvents();
      clicks += "d";
      modal.Close();
    });
    modal.ShowModal();
    RunPendingEvents();
    clicks += "e";
  });
  for (int again = 0; again < 2; ++again) RunPendingEvents();
  EXPECT_EQ(clicks, "abcde");
}

}  // namespace
