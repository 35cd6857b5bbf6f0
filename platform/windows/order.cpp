#include "platform/windows/order.h"

#include <windows.h>

#include <algorithm>
#include <array>
#include <numeric>
#include <string_view>

#include "platform/windows/wide.h"

namespace platform {
namespace {

// A sort key is bytes, also where the text is wide.
int Map(const std::wstring& text, char* buffer, int room) {
  constexpr DWORD flags = LCMAP_SORTKEY | NORM_IGNORECASE;
  return ::LCMapStringW(LOCALE_USER_DEFAULT, flags, text.data(), static_cast<int>(text.size()),
                        reinterpret_cast<wchar_t*>(buffer), room);
}

// Bytes that compare as the texts do in CompareStringA, all in one piece of memory. They take one call a text, where
// comparing the texts themselves would take one a comparison.
class SortKeys {
 public:
  void Add(const std::string& added) {
    const std::wstring text = ToShown(added);
    std::array<char, 512> enough;  // for all names but the longest
    const std::size_t start = bytes_.size();
    if (const int length = Map(text, enough.data(), static_cast<int>(enough.size())); length > 0) {
      bytes_.append(enough.data(), static_cast<std::size_t>(length));
    } else {
      const int longer = Map(text, nullptr, 0);
      bytes_.resize(start + static_cast<std::size_t>(longer));
      Map(text, bytes_.data() + start, longer);
    }
    starts_.push_back(start);
  }

  std::string_view Of(std::size_t text) const {
    const std::size_t end = text + 1 < starts_.size() ? starts_[text + 1] : bytes_.size();
    return std::string_view(bytes_).substr(starts_[text], end - starts_[text]);
  }

 private:
  std::string bytes_;
  std::vector<std::size_t> starts_;
};

}  // namespace

std::vector<std::size_t> InOrder(const std::vector<const std::string*>& texts) {
  SortKeys keys;
  for (const std::string* text : texts) keys.Add(*text);
  const auto before = [&](std::size_t left, std::size_t right) {
    const int order = keys.Of(left).compare(keys.Of(right));
    return order != 0 ? order < 0 : *texts[left] < *texts[right];
  };
  std::vector<std::size_t> places(texts.size());
  std::iota(places.begin(), places.end(), std::size_t{0});
  if (!std::is_sorted(places.begin(), places.end(), before)) std::sort(places.begin(), places.end(), before);
  return places;
}

}  // namespace platform
