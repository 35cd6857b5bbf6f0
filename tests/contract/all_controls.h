// A window with controls of every kind that takes input.
#pragma once

#include <utility>

#include "platform/events.h"
#include "tests/contract/hand.h"

namespace contract {

class AllControls : public Machine {
 protected:
  AllControls() {
    const auto note = [this](const char* name) { return [this, name] { clicks += name; }; };
    list.OnClick = note("list ");
    list.OnDoubleClick = note("double ");
    list.OnKeyDown = [this](int keyCode) { clicks += std::to_string(keyCode) + " "; };
    button.OnClick = note("button ");
    image.OnClick = note("image ");
    combo.OnClick = note("combo ");
    close.OnClick = note("close ");
    for (const char* text : {"B", "A", "C"}) list.Add(text);
    for (const char* text : {"Um", "Dois"}) combo.Add(text);
    combo.Select(0);
    window.Show();
    RunPendingEvents();
  }

  // The handlers that ran since it was asked last, and what the list, the check box and the combo box say.
  string Seen() {
    for (const int value : {list.Selected(), check.Value(), combo.Selected()}) clicks += "/" + std::to_string(value);
    return std::exchange(clicks, "");
  }

  Window window{{.Caption = "Teste", .ClientWidth = 7500, .ClientHeight = 4500, .CloseOnEscape = true}};
  ListBox list{window, {150, 150, 1500, 1500}, ListBox::Order::Sorted};
  Button button{window, {1800, 150, 1500, 600}, "&Jogar", {.TenthsOfPoint = 180, .Bold = true}};
  CheckBox check{window, {1800, 900, 600, 600}, 101, "Usar disquete"};
  Frame frame{window, {4500, 150, 3000, 3000}, " Disquete "};
  ImageButton image{frame, {150, 300, 180, 195}, 203, "Excluir"};
  ComboBox combo{window, {150, 2100, 1500, 315}};
  Button close{window, {6000, 3900, 1335, 495}, "&Fechar"};
  Control* const inputs[6] = {&list, &button, &check, &image, &combo, &close};
  string clicks;
};

}  // namespace contract
