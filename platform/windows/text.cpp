#include "platform/text.h"

#include <windows.h>

#include "platform/windows/wide.h"

namespace platform {
namespace {

// In the code pages whose characters can have several bytes Windows promises neither that the length stays nor what
// becomes of bytes that are no character. A letter whose other case is as long is changed, and nothing else.
void RaiseFirst(char* text, std::size_t length) {
  if (static_cast<unsigned char>(*text) < 0x80) {
    if (*text >= 'a' && *text <= 'z') *text = static_cast<char>(*text - 'a' + 'A');
    return;
  }
  std::wstring letter = Decode(CP_ACP, MB_ERR_INVALID_CHARS, {text, length});
  ::CharUpperBuffW(letter.data(), static_cast<DWORD>(letter.size()));
  const AnsiName raised = NameToAnsi(letter);
  if (raised.IsExact && raised.Text.size() == length) raised.Text.copy(text, length);
}

}  // namespace

std::string FromUtf8(std::string_view utf8) {
  return ::GetACP() == CP_UTF8 ? std::string(utf8) : ToAnsi(Decode(CP_UTF8, 0, utf8));
}

std::string ToUtf8(std::string_view text) { return ::GetACP() == CP_UTF8 ? std::string(text) : Utf8Of(ToWide(text)); }

bool CharacterBeginsAt(std::string_view text, std::size_t position) {
  if (position >= text.size() || !HasLongCharacters()) return true;
  if (::GetACP() == CP_UTF8) return (static_cast<unsigned char>(text[position]) & 0xC0) != 0x80;
  bool begins = true;  // behind a byte that begins none; from there on they come in pairs
  while (position-- > 0 && ::IsDBCSLeadByte(static_cast<BYTE>(text[position]))) begins = !begins;
  return begins;
}

std::string CharUpperBuffA(std::string text) {
  if (!HasLongCharacters()) {
    ::CharUpperBuffA(text.data(), static_cast<DWORD>(text.size()));
    return text;
  }
  for (std::size_t i = 0, length = 0; i < text.size(); i += length) {
    length = LengthOfFirst(std::string_view(text).substr(i));
    RaiseFirst(text.data() + i, length);
  }
  return text;
}

int CompareStringA(std::string_view left, std::string_view right) {
  const std::wstring first = ToShown(left), second = ToShown(right);
  const int result = ::CompareStringW(LOCALE_USER_DEFAULT, NORM_IGNORECASE, first.data(),
                                      static_cast<int>(first.size()), second.data(), static_cast<int>(second.size()));
  return result == 0 ? left.compare(right) : result - CSTR_EQUAL;
}

}  // namespace platform
