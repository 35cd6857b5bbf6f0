#include <stdexcept>

#include "platform/controls.h"
#include "platform/text.h"
#include "tests/contract/all_controls.h"

namespace {

using namespace contract;

using Texts = std::vector<string>;

constexpr int Enter = 13, Down = 40;
constexpr const char* Untouched = "/-1/0/0";

class Controls : public AllControls {};

Texts TextsOf(const ListBox& list) {
  Texts texts;
  for (int i = 0; i < list.Count(); ++i) texts.push_back(list.Text(i));
  return texts;
}

TEST_F(Controls, SortedListKeepsTheOrderOfTheLanguageAndFindsWholeTextsWithoutCase) {
  const Texts order = {"1942",       "abelha",  "Água"_ansi, "ALFA",      "Castelo 10", "castelo 3",
                       "épico"_ansi, "Estrela", "maca",      "maçã"_ansi, "Macaco",     "Zebra"};
  const Texts added(order.rbegin(), order.rend());
  ListBox sorted(window, {100, 1700, 1500, 1000}, ListBox::Order::Sorted);
  ListBox plain(window, {100, 1700, 1500, 1000}, ListBox::Order::AsAdded);
  EXPECT_EQ(sorted.FindExact("maca"), -1);
  for (ListBox* box : {&sorted, &plain}) {
    for (const string& text : added) box->Add(text);
    EXPECT_EQ(TextsOf(*box), box == &sorted ? order : added);
    box->Fill({added.begin() + 1, added.end()});
    box->Add(added[0]);
    EXPECT_EQ(TextsOf(*box).back(), box == &sorted ? order.back() : added[0]);
    box->Fill(added);
    EXPECT_EQ(TextsOf(*box), box == &sorted ? order : added);
    EXPECT_EQ(box->Text(-1) + box->Text(box->Count()), "");
  }
  for (std::size_t i = 1; i < order.size(); ++i) EXPECT_LT(CompareStringA(order[i - 1], order[i]), 0) << i;
  const std::pair<string, int> wanted[] = {{"áGUA"_ansi, 2}, {"Agua", -1}, {"mac", -1}, {"maca ", -1}, {"", -1}};
  for (const auto& [text, index] : wanted) EXPECT_EQ(sorted.FindExact(text), index) << text;
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
  EXPECT_EQ(Seen(), "/1/1/1");
  list.Clear();
  RunPendingEvents();
  EXPECT_EQ(Seen(), "/-1/1/1");
  EXPECT_EQ(list.Count(), 0);
}

TEST_F(Controls, HandActsOnWhatTakesInputOnly) {
  const auto act = [this] {
    Choose(list, 1);
    PressKey(list, Enter);
    Click(button);
    Click(image);
    Click(check);
    Choose(combo, 1 - combo.Selected());
    return Seen();
  };
  for (const auto change : {&Control::Enable, &Control::Show}) {
    for (Control* control : inputs) (control->*change)(false);
    EXPECT_TRUE(list.Enabled() == (change == &Control::Show) && list.Visible() == (change == &Control::Enable));
    EXPECT_EQ(act(), Untouched);
    for (Control* control : inputs) (control->*change)(true);
  }
  window.Enable(false);
  EXPECT_EQ(act(), Untouched);
  UseCloseBox(window);
  EXPECT_FALSE(window.IsClosed() || window.Enabled());
  window.Enable(true);
  EXPECT_EQ(act(), "list 13 button image combo /1/1/1");
  EXPECT_EQ(act(), "list 13 button image combo /1/0/0");
  DoubleClick(list, 2);
  EXPECT_EQ(Seen(), "list double /2/0/0");
  list.Select(0);
  PressKey(list, Down);
  EXPECT_EQ(Seen(), "40 list /1/0/0");
}

TEST_F(Controls, PositionsSurviveWithinAPixel) {
  constexpr int pixel = 15;
  EXPECT_NEAR(window.Left() + window.Width() / 2, ScreenWidth() / 2, 2 * pixel);
  EXPECT_TRUE(window.Width() >= 7500 && window.Height() >= 4500);
  for (const int place : {0, 1234, 3000, -150}) {
    const int top = window.Top();
    window.SetLeft(place);
    EXPECT_EQ(window.Top(), top);
    window.SetTop(place);
    EXPECT_NEAR(window.Left(), place, pixel);
    EXPECT_NEAR(window.Top(), place, pixel);
  }
}

TEST_F(Controls, ClosingRunsUnloadOnceAndLeavesTheLastAnswers) {
  window.OnUnload = [&] {
    clicks += "unload ";
    window.Close();
    EXPECT_TRUE(!window.IsClosed() && list.Count() == 3);
    throw 1;  // stops nothing
  };
  list.Select(1);
  check.SetValue(1);
  combo.Select(1);
  UseCloseBox(window);
  window.Close();
  EXPECT_TRUE(window.IsClosed());
  list.Add("D");
  list.Select(0);
  list.Clear();
  check.SetValue(0);
  combo.Select(0);
  for (Control* control : inputs) {
    control->SetCaption("Outro");
    control->Enable(false);
    control->Show(false);
    EXPECT_TRUE(control->Enabled() && control->Visible());
  }
  window.SetCaption("Outra");
  window.Show();
  window.ShowModal();
  EXPECT_EQ(Seen(), "unload /1/1/1");
  EXPECT_EQ(TextsOf(list), (Texts{"A", "B", "C"}));
  EXPECT_EQ(button.Caption() + window.Caption(), "&JogarTeste");
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
  EXPECT_TRUE(modal.IsClosed() && window.Enabled() && !window.IsClosed());
  button.OnClick = [this] {
    clicks += "thrown ";
    throw std::runtime_error("dropped at the handler's edge");
  };
  for (int again = 0; again < 2; ++again) Click(button);
  EXPECT_EQ(Seen(), "inside thrown thrown /-1/0/0");
}

TEST_F(Controls, TimersTickWhileTheyAreEnabled) {
  int ticks = 0, others = 0;
  Timer timer(window, 10), other(window, 10);
  timer.OnTick = [&] { timer.Enable(++ticks != 3); };
  other.OnTick = [&] { ++others; };
  EXPECT_FALSE(timer.Enabled());
  timer.Enable(true);
  EXPECT_TRUE(WaitUntil([&] { return ticks == 3; }, {&timer, &other}) && others == 0);
  other.Enable(true);
  EXPECT_TRUE(WaitUntil([&] { return others >= 5; }, {&timer, &other}));
  EXPECT_TRUE(ticks == 3 && !timer.Enabled());
}

// The first window made is the main one. It is closed while events run inside a handler, deep in the loop.
TEST_F(Controls, PendingEventsRunInOrderAndTheLoopEndsWithTheMainWindow) {
  for (const char* name : {"a", "b", "c"}) QueueEvent([this, name] { clicks += name; });
  EXPECT_EQ(clicks, "");
  for (int again = 0; again < 2; ++again) RunPendingEvents();
  EXPECT_EQ(clicks, "abc");
  Window second({.Caption = "Segunda", .ClientWidth = 3000, .ClientHeight = 3000});
  QueueEvent([&] {
    second.Close();
    QueueEvent([&] { window.Close(); });
    RunPendingEvents();
    clicks += window.IsClosed() ? " closed" : " open";
    RunPendingEvents();
    list.Add("D");
  });
  RunEventLoop();
  EXPECT_EQ(clicks, "abc closed");
  EXPECT_EQ(list.Count(), 3);
}

}  // namespace
