// The user's hand, on whichever platform the tests run, and a window for it with controls of every kind that takes
// input. The hand reaches what a user could reach: nothing happens to what is disabled, hidden, or behind a modal
// window.
#pragma once

#include <functional>
#include <utility>

#include "platform/controls.h"
#include "platform/events.h"
#include "tests/contract/machine.h"

namespace contract {

void Click(Button& button);
void Click(ImageButton& button);
void Click(CheckBox& box);
void Choose(ListBox& list, int index);
void HoldKey(ListBox& list, int keyCode, int repeats);  // pressed, repeated so many times, and released
void UseCloseBox(Window& window);

// Happens when the program handles its pending events, or in an event loop.
void QueueEvent(std::function<void()> event);

// What the user does in front of the next modal window. It has to close the window.
void QueueModal(std::function<void()> script);

class AllControls : public Machine {
 protected:
  AllControls() {
    const auto note = [this](const char* name) { return [this, name] { clicks += name; }; };
    list.OnClick = note("list ");
    button.OnClick = note("button ");
    image.OnClick = note("image ");
    combo.OnClick = note("combo ");
    for (const char* text : {"B", "A", "C"}) list.Add(text);
    for (const char* text : {"Um", "Dois"}) combo.Add(text);
    combo.Select(0);
    window.Show();
    RunPendingEvents();
  }

  // The handlers that ran since it was asked last, and what the list, the check box and the combo box say.
  string Seen() {
    const string box = check.Value() == 1 ? "checked" : "unchecked";
    return std::exchange(clicks, "") + "| row " + std::to_string(list.Selected()) + ", " + box + ", choice " +
           std::to_string(combo.Selected());
  }

  Window window{{.Caption = "Teste", .ClientWidth = 7500, .ClientHeight = 4500}};
  ListBox list{window, {150, 150, 1500, 1500}, ListBox::Order::Sorted};
  Button button{window, {1800, 150, 1500, 600}, "&Jogar", {.TenthsOfPoint = 180, .Bold = true}};
  CheckBox check{window, {1800, 900, 600, 600}, 101, "Usar disquete"};
  Frame frame{window, {4500, 150, 3000, 3000}, " Disquete "};
  ImageButton image{frame, {150, 300, 180, 195}, 203, "Excluir"};
  ComboBox combo{window, {150, 2100, 1500, 315}};
  Control* const inputs[5] = {&list, &button, &check, &image, &combo};
  string clicks;
};

}  // namespace contract
