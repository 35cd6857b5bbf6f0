#include <windows.h>

#include <algorithm>
#include <vector>

#include "platform/windows/control.h"
#include "platform/windows/events.h"
#include "platform/windows/order.h"
#include "platform/windows/wide.h"

namespace platform {
namespace {

// A list is a window of wide texts: Wine's conversion of an entry's text, between such a list and one who asks for
// ANSI, has room for 512 characters, and does not look.
std::string NativeText(HWND list, int index) {
  const LRESULT length = ::SendMessageW(list, LB_GETTEXTLEN, static_cast<WPARAM>(index), 0);
  if (index < 0 || length <= 0) return {};
  std::wstring text(static_cast<std::size_t>(length) + 1, L'\0');  // with the closing zero
  const LRESULT copied =
      ::SendMessageW(list, LB_GETTEXT, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(text.data()));
  text.resize(copied > 0 ? static_cast<std::size_t>(copied) : 0);
  return ToAnsi(text);
}

// What LB_FINDSTRINGEXACT finds, for the list of a closed window.
int FindExactIn(const std::vector<std::string>& texts, const std::string& text) {
  const std::wstring wanted = ToShown(text);
  const auto same = [&](const std::string& entry) {
    return ::CompareStringW(LOCALE_USER_DEFAULT, NORM_IGNORECASE, ToShown(entry).c_str(), -1, wanted.c_str(), -1) ==
           CSTR_EQUAL;
  };
  const auto found = std::find_if(texts.begin(), texts.end(), same);
  return found == texts.end() ? -1 : static_cast<int>(found - texts.begin());
}

// Of all texts together, as the list keeps them.
std::size_t BytesOf(const std::vector<std::string>& texts) {
  std::size_t bytes = 0;
  for (const std::string& text : texts) bytes += (text.size() + 1) * sizeof(wchar_t);
  return bytes;
}

// The texts as the list is to hold them.
std::vector<const std::string*> AsListed(const std::vector<std::string>& texts, bool sorted) {
  std::vector<const std::string*> given;
  given.reserve(texts.size());
  for (const std::string& text : texts) given.push_back(&text);
  if (!sorted) return given;
  std::vector<const std::string*> ordered;
  ordered.reserve(texts.size());
  for (const std::size_t place : InOrder(given)) ordered.push_back(given[place]);
  return ordered;
}

struct ListBoxState : ControlState {
  explicit ListBoxState(const ListBox& object) : Object(object) {
    EnterIsKey = true;
    ShowsText = false;
  }

  void OnNotification(int code) override {
    if (code == LBN_SELCHANGE) Raise(Object.OnClick);
    if (code == LBN_DBLCLK) Raise(Object.OnDoubleClick);
  }

  bool OnKey(int key, bool repeated) override {
    if (!repeated) Raise(Object.OnKeyDown, key);
    return false;
  }

  void Remember() override {
    LastSelected = Object.Selected();
    for (int i = 0, count = Object.Count(); i < count; ++i) LastTexts.push_back(Object.Text(i));
  }

  // The text as it was given, which an entry's data leads to where what is shown would not give it back.
  std::string TextOf(int index) const {
    const LRESULT kept = ::SendMessageW(Handle, LB_GETITEMDATA, static_cast<WPARAM>(index), 0);
    if (kept > 0 && kept <= std::ssize(Foreign)) return Foreign[static_cast<std::size_t>(kept - 1)];
    return NativeText(Handle, index);
  }

  void Put(UINT message, WPARAM place, const std::string& text) {
    const std::wstring shown = ToShown(text);
    const LRESULT index = ::SendMessageW(Handle, message, place, reinterpret_cast<LPARAM>(shown.c_str()));
    if (!HasLongCharacters() || ToAnsi(shown) == text) return;
    Foreign.push_back(text);
    ::SendMessageW(Handle, LB_SETITEMDATA, static_cast<WPARAM>(index), std::ssize(Foreign));
  }

  const ListBox& Object;
  std::vector<std::string> Foreign;    // in the order in which they came
  std::vector<std::string> LastTexts;  // once the window is closed
  int LastSelected = -1;
};

ListBoxState& StateOf(const ListBox& list) { return static_cast<ListBoxState&>(list.State()); }

}  // namespace

ListBox::ListBox(const Container& container, const Bounds& bounds, Order order) {
  const DWORD sorted = order == Order::Sorted ? LBS_SORT : 0;
  CreateControl(MakeState<ListBoxState>(state_, *this), container, bounds,
                {"LISTBOX", WS_TABSTOP | WS_VSCROLL | LBS_NOTIFY | LBS_NOINTEGRALHEIGHT | sorted, WS_EX_CLIENTEDGE});
}

void ListBox::Add(const std::string& text) { StateOf(*this).Put(LB_ADDSTRING, 0, text); }

// The room for all texts is made at once. Texts that are in the list's own order already need no place looked up for
// them, which would be most of the work. A list with a scroll bar that is drawn anew for each entry takes a hundred
// times as long.
void ListBox::Fill(const std::vector<std::string>& texts) {
  if (state_->Handle == nullptr) return;
  const bool sorted = (::GetWindowLongPtrA(state_->Handle, GWL_STYLE) & LBS_SORT) != 0;
  ::SendMessageA(state_->Handle, WM_SETREDRAW, FALSE, 0);
  Clear();
  ::SendMessageA(state_->Handle, LB_INITSTORAGE, texts.size(), static_cast<LPARAM>(BytesOf(texts)));
  for (const std::string* text : AsListed(texts, sorted)) {
    StateOf(*this).Put(LB_INSERTSTRING, static_cast<WPARAM>(-1), *text);
  }
  ::SendMessageA(state_->Handle, WM_SETREDRAW, TRUE, 0);
  ::InvalidateRect(state_->Handle, nullptr, TRUE);
}

void ListBox::Clear() {
  ::SendMessageA(state_->Handle, LB_RESETCONTENT, 0, 0);
  StateOf(*this).Foreign.clear();
}

int ListBox::Count() const {
  if (state_->Handle == nullptr) return static_cast<int>(StateOf(*this).LastTexts.size());
  return static_cast<int>(::SendMessageA(state_->Handle, LB_GETCOUNT, 0, 0));
}

std::string ListBox::Text(int index) const {
  if (state_->Handle != nullptr) return StateOf(*this).TextOf(index);
  return index >= 0 && index < Count() ? StateOf(*this).LastTexts[static_cast<std::size_t>(index)] : std::string();
}

int ListBox::Selected() const {
  if (state_->Handle == nullptr) return StateOf(*this).LastSelected;
  return static_cast<int>(::SendMessageA(state_->Handle, LB_GETCURSEL, 0, 0));
}

void ListBox::Select(int index) { ::SendMessageA(state_->Handle, LB_SETCURSEL, static_cast<WPARAM>(index), 0); }

int ListBox::FindExact(const std::string& text) const {
  if (state_->Handle == nullptr) return FindExactIn(StateOf(*this).LastTexts, text);
  return static_cast<int>(::SendMessageW(state_->Handle, LB_FINDSTRINGEXACT, static_cast<WPARAM>(-1),
                                         reinterpret_cast<LPARAM>(ToShown(text).c_str())));
}

}  // namespace platform
