#include "platform/windows/wic.h"

// clang-format off
#include <windows.h>
#include <initguid.h>
#include <objbase.h>
#include <wincodec.h>
// clang-format on

#include <algorithm>
#include <cstdint>
#include <memory>
#include <utility>

#include "platform/windows/system_library.h"

namespace platform {
namespace {

struct Releaser {
  void operator()(IUnknown* object) const { object->Release(); }
};
template <typename T>
using Owned = std::unique_ptr<T, Releaser>;

// The object that `create` puts into the pointer it is given; null when it fails.
template <typename T, typename Create>
Owned<T> Obtain(Create create) {
  T* object = nullptr;
  return Owned<T>(SUCCEEDED(create(&object)) ? object : nullptr);
}

Owned<IWICImagingFactory> CreateFactory() {
  const auto initialize = SystemFunction<HRESULT WINAPI(LPVOID, DWORD)>("ole32.dll", "CoInitializeEx");
  const auto create =
      SystemFunction<HRESULT WINAPI(REFCLSID, LPUNKNOWN, DWORD, REFIID, LPVOID*)>("ole32.dll", "CoCreateInstance");
  if (initialize == nullptr || create == nullptr) return nullptr;
  initialize(nullptr, COINIT_APARTMENTTHREADED);
  return Obtain<IWICImagingFactory>([&](IWICImagingFactory** factory) {
    return create(CLSID_WICImagingFactory, nullptr, CLSCTX_INPROC_SERVER, IID_IWICImagingFactory,
                  reinterpret_cast<LPVOID*>(factory));
  });
}

// Made once, when the first picture needs it, and alive until the process ends.
IWICImagingFactory* Factory() {
  static IWICImagingFactory* const factory = CreateFactory().release();
  return factory;
}

Owned<IWICBitmapDecoder> OpenDecoder(IWICImagingFactory* factory, IWICStream* stream, std::string_view content) {
  auto* bytes = reinterpret_cast<BYTE*>(const_cast<char*>(content.data()));  // the stream only reads them
  if (FAILED(stream->InitializeFromMemory(bytes, static_cast<DWORD>(content.size())))) return nullptr;
  return Obtain<IWICBitmapDecoder>([&](IWICBitmapDecoder** decoder) {
    return factory->CreateDecoderFromStream(stream, nullptr, WICDecodeMetadataCacheOnDemand, decoder);
  });
}

// A colour multiplied by its opacity, in front of white.
std::uint32_t OverWhite(std::uint32_t pixel) { return (pixel & 0xFFFFFF) + (0xFF - (pixel >> 24)) * 0x010101; }

using Source = Owned<IWICBitmapSource>;

Source Converted(IWICImagingFactory* factory, const Source& source) {
  auto converter =
      Obtain<IWICFormatConverter>([&](IWICFormatConverter** made) { return factory->CreateFormatConverter(made); });
  const bool done = source && converter &&
                    SUCCEEDED(converter->Initialize(source.get(), GUID_WICPixelFormat32bppPBGRA,
                                                    WICBitmapDitherTypeNone, nullptr, 0, WICBitmapPaletteTypeCustom));
  return done ? std::move(converter) : nullptr;
}

// Wine leaves out pixels in place of mixing them.
Source Reduced(IWICImagingFactory* factory, const Source& source, SIZE most) {
  UINT width = 0, height = 0;
  if (!source || FAILED(source->GetSize(&width, &height))) return nullptr;
  auto scaler = Obtain<IWICBitmapScaler>([&](IWICBitmapScaler** made) { return factory->CreateBitmapScaler(made); });
  const bool done = scaler && SUCCEEDED(scaler->Initialize(source.get(), std::min(width, static_cast<UINT>(most.cx)),
                                                           std::min(height, static_cast<UINT>(most.cy)),
                                                           WICBitmapInterpolationModeFant));
  return done ? std::move(scaler) : nullptr;
}

std::optional<Pixels> ReadPixels(IWICBitmapSource* source) {
  UINT width = 0, height = 0;
  if (FAILED(source->GetSize(&width, &height)) || width == 0 || height == 0) return std::nullopt;
  Pixels pixels{static_cast<int>(width), static_cast<int>(height),
                std::vector<std::uint32_t>(std::size_t{width} * height)};
  if (FAILED(source->CopyPixels(nullptr, 4 * width, static_cast<UINT>(4 * pixels.Colours.size()),
                                reinterpret_cast<BYTE*>(pixels.Colours.data())))) {
    return std::nullopt;
  }
  for (std::uint32_t& pixel : pixels.Colours) pixel = OverWhite(pixel);
  return pixels;
}

}  // namespace

std::optional<Pixels> Decode(std::string_view content, PictureFormat format, SIZE most) {
  IWICImagingFactory* factory = Factory();
  if (factory == nullptr || content.size() > MAXDWORD) return std::nullopt;
  const auto stream = Obtain<IWICStream>([&](IWICStream** made) { return factory->CreateStream(made); });
  if (!stream) return std::nullopt;
  const auto decoder = OpenDecoder(factory, stream.get(), content);
  if (!decoder) return std::nullopt;
  const Source frame =
      Obtain<IWICBitmapFrameDecode>([&](IWICBitmapFrameDecode** first) { return decoder->GetFrame(0, first); });
  // Asked first, JPEG's decoder makes a smaller picture at once. Numbers of colours in a table cannot be mixed.
  const bool reducedFirst = format == PictureFormat::Jpeg;
  const Source source = reducedFirst ? Converted(factory, Reduced(factory, frame, most))
                                     : Reduced(factory, Converted(factory, frame), most);
  return source ? ReadPixels(source.get()) : std::nullopt;
}

}  // namespace platform
