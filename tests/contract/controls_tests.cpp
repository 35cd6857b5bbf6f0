#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

#include "platform/controls.h"
#include "platform/events.h"
#include "platform/text.h"
#include "tests/contract/hand.h"

namespace contract {
namespace {

using platform::Button;
using platform::CheckBox;
using platform::ComboBox;
using platform::Frame;
using platform::ImageButton;
using platform::Label;
using platform::ListBox;
using platform::Timer;
using platform::Window;

constexpr int Enter = 13, Down = 40;
constexpr int Icon = 101, SmallPicture = 203;  // of a program's resources, which these tests do not have

// A window with one control of each kind, shown.
class Controls : public testing::Test {
 protected:
  Controls() {
    list.OnClick = [this] { clicks += "list "; };
    list.OnDoubleClick = [this] { clicks += "double "; };
    list.OnKeyDown = [this](int keyCode) { clicks += std::to_string(keyCode) + " "; };
    button.OnClick = [this] { clicks += "button "; };
    image.OnClick = [this] { clicks += "image "; };
    combo.OnClick = [this] { clicks += "combo "; };
    for (const char* text : {"B", "A", "C"}) list.Add(text);
    for (const char* text : {"Um", "Dois"}) combo.Add(text);
    window.Show();
    platform::RunPendingEvents();
  }

  std::string Clicks() { return std::exchange(clicks, ""); }

  std::vector<std::string> Texts(const ListBox& from) {
    std::vector<std::string> texts;
    for (int i = 0; i < from.Count(); ++i) texts.push_back(from.Text(i));
    return texts;
  }

  Desk desk;
  Window window{{.Caption = "Teste", .ClientWidth = 6000, .ClientHeight = 4000}};
  ListBox list{window, {100, 100, 1500, 1500}, ListBox::Order::Sorted};
  Button button{window, {1700, 100, 1000, 400}, "&Jogar", {.TenthsOfPoint = 180, .Bold = true}};
  Frame frame{window, {3000, 100, 2900, 2000}, " Quadro "};
  ImageButton image{frame, {100, 400, 180, 195}, SmallPicture, "Excluir"};
  CheckBox check{frame, {100, 700, 600, 600}, Icon, "Usar"};
  ComboBox combo{window, {1700, 600, 1000, 315}};
  Label label{window, 100, 3000, {}};
  std::string clicks;
};

TEST_F(Controls, SortedListKeepsTheOrderOfTheLanguageWithoutRegardToCase) {
  const std::vector<std::string> order = {"1942",       "abelha",     "\xC1gua" /* A acute */,
                                          "ALFA",       "Castelo 10", "castelo 3",
                                          "\xE9pico",   "Estrela",    "maca",
                                          "ma\xE7\xE3", "Macaco",     "Zebra"};
  ListBox sorted(window, {100, 1700, 1500, 1000}, ListBox::Order::Sorted);
  ListBox plain(window, {100, 1700, 1500, 1000}, ListBox::Order::AsAdded);
  for (std::size_t i = 0; i < order.size(); ++i) {
    const std::string& text = order[(i * 7 + 3) % order.size()];  // 7 and 12 have no common divisor: each once
    sorted.Add(text);
    plain.Add(text);
  }
  EXPECT_EQ(Texts(sorted), order);
  EXPECT_EQ(plain.Text(0), order[3]);
  EXPECT_EQ(plain.Text(1), order[10]);
  for (std::size_t i = 1; i < order.size(); ++i) EXPECT_LT(platform::CompareStringA(order[i - 1], order[i]), 0) << i;
  EXPECT_EQ(sorted.Text(-1), "");
  EXPECT_EQ(sorted.Text(sorted.Count()), "");
}

TEST_F(Controls, SelectionInCodeIsSilentAndNeverGuesses) {
  struct Case {
    int Select, Selected;
  };
  for (const auto& [select, selected] : {Case{1, 1}, Case{2, 2}, Case{3, 2}, Case{-1, -1}, Case{-2, -1}, Case{0, 0}}) {
    list.Select(select);
    EXPECT_EQ(list.Selected(), selected) << select;
  }
  list.Add("0");  // comes before the selected one
  EXPECT_EQ(list.Text(list.Selected()), "A");
  combo.Select(1);
  EXPECT_EQ(combo.Selected(), 1);
  list.Clear();
  EXPECT_EQ(list.Selected(), -1);
  EXPECT_EQ(list.Count(), 0);
  platform::RunPendingEvents();
  EXPECT_EQ(Clicks(), "");
}

TEST_F(Controls, FindExactComparesTheWholeTextWithoutCase) {
  list.Add("\xC1gua Azul");
  EXPECT_EQ(list.Text(list.FindExact("\xE1GUA azul")), "\xC1gua Azul");
  for (const char* missing : {"Agua Azul", "\xC1gua", "\xC1gua Azul ", ""}) EXPECT_EQ(list.FindExact(missing), -1);
  list.Select(2);
  EXPECT_EQ(list.FindExact("b"), list.FindExact("B"));
  list.Clear();
  EXPECT_EQ(list.FindExact("B"), -1);
}

TEST_F(Controls, HandActsOnTheList) {
  Choose(list, 1);
  EXPECT_EQ(list.Selected(), 1);
  Choose(list, 1);
  EXPECT_EQ(Clicks(), "list list ");
  DoubleClick(list, 2);
  EXPECT_EQ(list.Selected(), 2);
  EXPECT_EQ(Clicks(), "list double ");
  list.Select(0);
  PressKey(list, Enter);
  EXPECT_EQ(list.Selected(), 0);
  PressKey(list, Down);
  EXPECT_EQ(list.Selected(), 1);
  EXPECT_EQ(Clicks(), "13 40 list ");
}

TEST_F(Controls, HandActsOnButtonsAndBoxes) {
  Click(button);
  Click(image);
  EXPECT_EQ(Clicks(), "button image ");
  Click(check);
  EXPECT_EQ(check.Value(), 1);
  Click(check);
  EXPECT_EQ(check.Value(), 0);
  for (const int value : {1, 0, 1}) {
    check.SetValue(value);
    EXPECT_EQ(check.Value(), value);
  }
  combo.Select(0);
  Choose(combo, 1);
  EXPECT_EQ(combo.Selected(), 1);
  EXPECT_EQ(Clicks(), "combo ");
}

TEST_F(Controls, WhatTakesNoInputCannotBeReached) {
  platform::Control* const all[] = {&list, &button, &image, &check, &combo};
  const auto reached = [this] {
    Choose(list, 1);
    PressKey(list, Enter);
    Click(button);
    Click(image);
    Click(check);
    combo.Select(0);
    Choose(combo, 1);
    return Clicks() + std::to_string(check.Value());
  };
  for (platform::Control* control : all) control->Enable(false);
  EXPECT_EQ(reached(), "0");
  for (platform::Control* control : all) {
    control->Enable(true);
    control->Show(false);
    EXPECT_TRUE(control->Enabled() && !control->Visible());
  }
  EXPECT_EQ(reached(), "0");
  for (platform::Control* control : all) control->Show(true);
  window.Enable(false);
  EXPECT_FALSE(window.Enabled());
  EXPECT_EQ(reached(), "0");
  UseCloseBox(window);
  EXPECT_FALSE(window.IsClosed());
  window.Enable(true);
  EXPECT_EQ(reached(), "list 13 button image combo 1");
}

TEST_F(Controls, TextsAndPicturesComeBack) {
  button.SetToolTip(
      "Come\xE7"
      "a");
  EXPECT_EQ(button.Caption(), "&Jogar");
  button.SetIcon(Icon);
  for (platform::Control* control : std::initializer_list<platform::Control*>{&button, &image, &check, &list}) {
    control->SetToolTip("Dica & tudo");
    EXPECT_EQ(control->ToolTip(), "Dica & tudo");
  }
  label.SetCaption("Seta\r\ncima");
  frame.SetCaption(" Disquete ");
  window.SetCaption("Copiando...");
  EXPECT_EQ(label.Caption() + frame.Caption() + window.Caption(), "Seta\r\ncima Disquete Copiando...");
  EXPECT_NE(window.Handle(), 0);
  EXPECT_NE(list.Handle(), window.Handle());
}

TEST_F(Controls, PositionsSurviveWithinAPixel) {
  constexpr int pixel = 15;
  EXPECT_NEAR(window.Left() + window.Width() / 2, platform::ScreenWidth() / 2, 2 * pixel);
  EXPECT_GE(window.Width(), 6000);
  EXPECT_GE(window.Height(), 4000);
  for (const int place : {0, 1234, 3000, -150}) {
    const int top = window.Top();
    window.SetLeft(place);
    EXPECT_NEAR(window.Left(), place, pixel);
    EXPECT_EQ(window.Top(), top);
    window.SetTop(place);
    EXPECT_NEAR(window.Top(), place, pixel);
  }
}

TEST_F(Controls, ClosingRunsUnloadOnceAndLeavesTheLastAnswers) {
  int unloaded = 0;
  window.OnUnload = [&] {
    ++unloaded;
    window.Close();
    EXPECT_FALSE(window.IsClosed());
    EXPECT_EQ(list.Count(), 3);
  };
  list.Select(1);
  check.SetValue(1);
  combo.Select(1);
  UseCloseBox(window);
  window.Close();
  EXPECT_TRUE(window.IsClosed());
  EXPECT_EQ(unloaded, 1);

  list.Add("D");
  list.Select(0);
  list.Clear();
  check.SetValue(0);
  combo.Select(0);
  button.SetCaption("Outro");
  button.Enable(false);
  button.Show(false);
  window.SetCaption("Outra");
  window.Show();
  window.ShowModal();
  EXPECT_EQ(Texts(list), (std::vector<std::string>{"A", "B", "C"}));
  EXPECT_EQ(list.FindExact("c"), 2);
  EXPECT_EQ(list.FindExact("D"), -1);
  EXPECT_EQ(list.Selected(), 1);
  EXPECT_EQ(check.Value(), 1);
  EXPECT_EQ(combo.Selected(), 1);
  EXPECT_EQ(button.Caption() + window.Caption(), "&JogarTeste");
  EXPECT_TRUE(button.Enabled() && button.Visible());
}

TEST_F(Controls, ModalWindowTakesAllInputUntilItIsClosed) {
  {
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
  }
  EXPECT_FALSE(window.IsClosed());
  EXPECT_TRUE(window.Enabled());
  Click(button);
  EXPECT_EQ(Clicks(), "inside button ");
}

TEST_F(Controls, ExceptionInAHandlerIsDropped) {
  button.OnClick = [this] {
    clicks += "thrown ";
    throw std::runtime_error("handler");
  };
  window.OnUnload = [] { throw 1; };
  Click(button);
  Click(button);
  EXPECT_EQ(Clicks(), "thrown thrown ");
  window.Close();
  EXPECT_TRUE(window.IsClosed());
}

TEST_F(Controls, TimersTickWhileTheyAreEnabled) {
  int ticks = 0, others = 0;
  Timer timer(window, 10), other(window, 10);
  timer.OnTick = [&] { ++ticks; };
  other.OnTick = [&] { ++others; };
  EXPECT_FALSE(timer.Enabled());
  timer.Enable(true);
  EXPECT_TRUE(WaitUntil([&] { return ticks >= 3; }, {&timer, &other}));
  EXPECT_EQ(others, 0);
  timer.OnTick = [&] {
    ++ticks;
    timer.Enable(false);
  };
  const int before = ticks;
  other.Enable(true);
  EXPECT_TRUE(WaitUntil([&] { return others >= 5; }, {&timer, &other}));
  EXPECT_EQ(ticks, before + 1);
  EXPECT_FALSE(timer.Enabled());
}

TEST_F(Controls, PendingEventsRunInOrder) {
  for (const char* name : {"a", "b", "c"}) QueueEvent([this, name] { clicks += name; });
  EXPECT_EQ(clicks, "");
  platform::RunPendingEvents();
  EXPECT_EQ(Clicks(), "abc");
  platform::RunPendingEvents();
  EXPECT_EQ(Clicks(), "");
}

// The first window made is the main one. It is closed while events run inside a handler, deep in the loop.
TEST_F(Controls, LoopEndsWhenTheMainWindowWasClosedInTheMiddleOfAHandler) {
  Window second({.Caption = "Segunda", .ClientWidth = 3000, .ClientHeight = 3000});
  QueueEvent([&] {
    second.Close();
    QueueEvent([&] { window.Close(); });
    platform::RunPendingEvents();
    clicks += window.IsClosed() ? "closed " : "open ";
    platform::RunPendingEvents();
    button.SetCaption("Ainda");
    list.Add("D");
  });
  platform::RunEventLoop();
  EXPECT_EQ(Clicks(), "closed ");
  EXPECT_EQ(list.Count(), 3);
}

TEST(Messages, AnswerIsTheButtonPressed) {
  using platform::Answer;
  using platform::Buttons;
  const Desk desk;
  struct Case {
    Buttons Offered;
    Answer Given;
  };
  for (const auto& [offered, given] :
       {Case{Buttons::Ok, Answer::Ok}, Case{Buttons::YesNoCancel, Answer::Yes}, Case{Buttons::YesNoCancel, Answer::No},
        Case{Buttons::YesNoCancel, Answer::Cancel}, Case{Buttons::RetryCancel, Answer::Retry},
        Case{Buttons::RetryCancel, Answer::Cancel}}) {
    QueueAnswer(given);
    EXPECT_EQ(platform::MessageBoxA("Texto", "T\xEDtulo", offered, platform::Icon::Question), given);
  }
}

}  // namespace
}  // namespace contract
