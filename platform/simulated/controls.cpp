#include "platform/controls.h"

#include <algorithm>
#include <iterator>
#include <utility>

#include "platform/simulated/machine.h"
#include "platform/simulated/text_order.h"

namespace platform {
namespace {

using simulated::TheMachine;

bool IsAlive(const ControlState& control) { return control.Window && !control.Window->Closed; }

void Join(ControlState& control, const Container& container, const Bounds& bounds) {
  control.Window = container.Parent.State().Facts;
  control.Window->Controls.push_back(control.Self);
  control.Place = {container.Left + bounds.Left, container.Top + bounds.Top, bounds.Width, bounds.Height};
}

void JoinWithIcon(ControlState& control, const Container& container, const Bounds& bounds, int icon,
                  const std::string& toolTip) {
  Join(control, container, bounds);
  control.Icon = icon;
  control.ToolTip = toolTip;
}

}  // namespace

Container::Container(Frame& frame) : Parent(frame.Parent), Left(frame.Place.Left), Top(frame.Place.Top) {}

Control::Control() : state_(std::make_unique<ControlState>()) {
  state_->Self = this;
  state_->Handle = static_cast<std::int32_t>(++TheMachine().LastHandle);
}

Control::~Control() {
  if (!state_->Window) return;
  if (state_->Window->Focus == this) state_->Window->Focus = nullptr;
  std::erase(state_->Window->Controls, this);
}

bool Control::Enabled() const { return state_->Enabled; }

void Control::Enable(bool enabled) {
  if (IsAlive(*state_)) state_->Enabled = enabled;
}

bool Control::Visible() const { return state_->Visible; }

void Control::Show(bool visible) {
  if (IsAlive(*state_)) state_->Visible = visible;
}

void Control::SetFocus() {
  if (IsAlive(*state_) && state_->Enabled && state_->Visible) state_->Window->Focus = this;
}

std::string Control::Caption() const { return state_->Caption; }

void Control::SetCaption(const std::string& caption) {
  if (IsAlive(*state_)) state_->Caption = caption;
}

std::string Control::ToolTip() const { return state_->ToolTip; }

void Control::SetToolTip(const std::string& text) {
  if (IsAlive(*state_)) state_->ToolTip = text;
}

std::string Control::AccessibleName() const { return state_->AccessibleName; }

void Control::SetAccessibleName(const std::string& name) {
  if (IsAlive(*state_)) state_->AccessibleName = name;
}

std::int32_t Control::Handle() const { return state_->Handle; }

Button::Button(const Container& container, const Bounds& bounds, const std::string& caption, const Font& font) {
  Join(*state_, container, bounds);
  state_->Caption = caption;
  state_->Letters = font;
}

Button::Button(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip) {
  JoinWithIcon(*state_, container, bounds, icon, toolTip);
}

void Button::SetIcon(int id) {
  if (IsAlive(*state_) && state_->Icon != 0) state_->Icon = id;
}

CheckBox::CheckBox(const Container& container, const Bounds& bounds, int icon, const std::string& toolTip) {
  JoinWithIcon(*state_, container, bounds, icon, toolTip);
}

int CheckBox::Value() const { return state_->Value; }

void CheckBox::SetValue(int value) {
  if (IsAlive(*state_)) state_->Value = value;
}

Label::Label(const Container& container, int left, int top, const Font& font, Ground ground) {
  Join(*state_, container, {left, top, 0, 0});
  state_->Letters = font;
  state_->WhiteGround = ground == Ground::White;
}

Frame::Frame(Window& window, const Bounds& bounds, const std::string& caption) : Parent(window), Place(bounds) {
  Join(*state_, window, bounds);
  state_->Caption = caption;
}

ImageBox::ImageBox(const Container& container, const Bounds& bounds) { Join(*state_, container, bounds); }

void ImageBox::SetPicture(const Picture& picture) {
  if (IsAlive(*state_)) state_->Shown = picture;
}

Picture ImageBox::ShownPicture() const { return state_->Shown; }

ImageButton::ImageButton(const Container& container, const Bounds& bounds, int picture, const std::string& toolTip) {
  JoinWithIcon(*state_, container, bounds, picture, toolTip);
}

namespace {

// Where a text goes among the others; in a sorted list behind those that equal it.
std::ptrdiff_t PlaceFor(const ControlState& list, const std::string& key) {
  const auto& entries = list.Entries;
  if (!list.Sorted) return std::ssize(entries);
  const auto place = std::upper_bound(entries.begin(), entries.end(), key,
                                      [](const std::string& added, const auto& entry) { return added < entry.Key; });
  return place - entries.begin();
}

void AddEntry(ControlState& list, const std::string& text) {
  if (!IsAlive(list)) return;
  simulated::ListEntry entry{text, simulated::SortKey(text)};
  const std::ptrdiff_t place = PlaceFor(list, entry.Key);
  list.Entries.insert(list.Entries.begin() + place, std::move(entry));
  if (list.Selected >= place) ++list.Selected;
}

bool HasEntry(const ControlState& list, int index) { return index >= 0 && index < std::ssize(list.Entries); }

}  // namespace

ListBox::ListBox(const Container& container, const Bounds& bounds, Order order) {
  Join(*state_, container, bounds);
  state_->Sorted = order == Order::Sorted;
}

void ListBox::Add(const std::string& text) { AddEntry(*state_, text); }

void ListBox::Fill(const std::vector<std::string>& texts) {
  Clear();
  if (!IsAlive(*state_)) return;
  state_->Entries.reserve(texts.size());
  for (const std::string& text : texts) state_->Entries.push_back({text, simulated::SortKey(text)});
  const auto before = [](const auto& left, const auto& right) { return left.Key < right.Key; };
  if (state_->Sorted) std::stable_sort(state_->Entries.begin(), state_->Entries.end(), before);
}

void ListBox::Clear() {
  if (!IsAlive(*state_)) return;
  state_->Entries.clear();
  state_->Selected = -1;
}

int ListBox::Count() const { return static_cast<int>(state_->Entries.size()); }

std::string ListBox::Text(int index) const {
  return HasEntry(*state_, index) ? state_->Entries[static_cast<std::size_t>(index)].Text : "";
}

int ListBox::Selected() const { return state_->Selected; }

void ListBox::Select(int index) {
  if (IsAlive(*state_) && (index == -1 || HasEntry(*state_, index))) state_->Selected = index;
}

int ListBox::FindExact(const std::string& text) const {
  const std::string key = simulated::SortKey(text);
  const auto found =
      std::find_if(state_->Entries.begin(), state_->Entries.end(), [&](const auto& entry) { return entry.Key == key; });
  return found == state_->Entries.end() ? -1 : static_cast<int>(found - state_->Entries.begin());
}

ComboBox::ComboBox(const Container& container, const Bounds& bounds) { Join(*state_, container, bounds); }

void ComboBox::Add(const std::string& text) { AddEntry(*state_, text); }

int ComboBox::Selected() const { return state_->Selected; }

void ComboBox::Select(int index) {
  if (IsAlive(*state_)) state_->Selected = HasEntry(*state_, index) ? index : -1;
}

}  // namespace platform

namespace platform::simulated {

bool TakesInput(const ControlState& control) {
  return control.Window && TakesInput(*control.Window) && control.Enabled && control.Visible;
}

}  // namespace platform::simulated
