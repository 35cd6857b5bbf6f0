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

#include "platform/windows/com.h"
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

// Made once, when the first picture needs it, and alive until the process ends.
IWICImagingFactory* Factory() {
  static auto* const factory =
      static_cast<IWICImagingFactory*>(CreateObject(CLSID_WICImagingFactory, IID_IWICImagingFactory));
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

// What the decoder needs as long as the frame is read.
struct OpenPicture {
  OpenPicture(IWICImagingFactory* factory, std::string_view content) {
    if (content.size() > MAXDWORD) return;
    Stream = Obtain<IWICStream>([&](IWICStream** made) { return factory->CreateStream(made); });
    if (Stream) Decoder = OpenDecoder(factory, Stream.get(), content);
    if (!Decoder) return;
    Frame = Obtain<IWICBitmapFrameDecode>([&](IWICBitmapFrameDecode** first) { return Decoder->GetFrame(0, first); });
  }

  Owned<IWICStream> Stream;
  Owned<IWICBitmapDecoder> Decoder;
  Source Frame;  // null when the decoder refuses it
};

std::optional<SIZE> FittedSize(const Source& frame, PixelSize most) {
  UINT width = 0, height = 0;
  if (!frame || FAILED(frame->GetSize(&width, &height)) || width == 0 || height == 0) return std::nullopt;
  if (width > MostSide || height > MostSide || std::int64_t{width} * height > MostPixels) return std::nullopt;
  const PixelSize fitted = Fitted({static_cast<int>(width), static_cast<int>(height)}, most);
  return SIZE{fitted.Width, fitted.Height};
}

// A stream in the system's memory, which grows.
Owned<IStream> CreateMemory() {
  const auto create = SystemFunction<HRESULT WINAPI(HGLOBAL, BOOL, LPSTREAM*)>("ole32.dll", "CreateStreamOnHGlobal");
  if (create == nullptr) return nullptr;
  return Obtain<IStream>([&](IStream** made) { return create(nullptr, TRUE, made); });
}

// All that was written to the stream.
std::optional<std::string> ContentOf(IStream* stream) {
  STATSTG facts{};
  if (FAILED(stream->Stat(&facts, STATFLAG_NONAME)) || FAILED(stream->Seek({}, STREAM_SEEK_SET, nullptr))) {
    return std::nullopt;
  }
  std::string content(static_cast<std::size_t>(facts.cbSize.QuadPart), '\0');
  ULONG read = 0;
  if (FAILED(stream->Read(content.data(), static_cast<ULONG>(content.size()), &read))) return std::nullopt;
  return read == content.size() ? std::optional(std::move(content)) : std::nullopt;
}

// Three bytes a pixel, blue first, as JPEG's encoder takes them.
std::vector<BYTE> Bytes(const Pixels& pixels) {
  std::vector<BYTE> bytes;
  bytes.reserve(3 * pixels.Colours.size());
  for (const std::uint32_t pixel : pixels.Colours) {
    for (const int shift : {0, 8, 16}) bytes.push_back(static_cast<BYTE>(pixel >> shift));
  }
  return bytes;
}

bool WriteFrame(IWICBitmapFrameEncode* frame, const Pixels& pixels) {
  const auto width = static_cast<UINT>(pixels.Width), height = static_cast<UINT>(pixels.Height);
  std::vector<BYTE> bytes = Bytes(pixels);
  WICPixelFormatGUID format = GUID_WICPixelFormat24bppBGR;
  return SUCCEEDED(frame->Initialize(nullptr)) && SUCCEEDED(frame->SetSize(width, height)) &&
         SUCCEEDED(frame->SetPixelFormat(&format)) && IsEqualGUID(format, GUID_WICPixelFormat24bppBGR) &&
         SUCCEEDED(frame->WritePixels(height, 3 * width, static_cast<UINT>(bytes.size()), bytes.data())) &&
         SUCCEEDED(frame->Commit());
}

}  // namespace

std::optional<Pixels> Decode(std::string_view content, PictureFormat format, SIZE most) {
  IWICImagingFactory* factory = Factory();
  if (factory == nullptr) return std::nullopt;
  const OpenPicture picture(factory, content);
  const Source& frame = picture.Frame;
  // Asked first, JPEG's decoder makes a smaller picture at once. Numbers of colours in a table cannot be mixed.
  const bool reducedFirst = format == PictureFormat::Jpeg;
  const Source source = reducedFirst ? Converted(factory, Reduced(factory, frame, most))
                                     : Reduced(factory, Converted(factory, frame), most);
  return source ? ReadPixels(source.get()) : std::nullopt;
}

std::optional<Pixels> DecodeFitted(std::string_view content, PixelSize most) {
  IWICImagingFactory* factory = Factory();
  if (factory == nullptr) return std::nullopt;
  const OpenPicture picture(factory, content);
  const auto size = FittedSize(picture.Frame, most);
  const Source source = size ? Reduced(factory, Converted(factory, picture.Frame), *size) : nullptr;
  return source ? ReadPixels(source.get()) : std::nullopt;
}

std::optional<std::string> EncodeJpeg(const Pixels& pixels) {
  IWICImagingFactory* factory = Factory();
  const Owned<IStream> stream = CreateMemory();
  if (factory == nullptr || !stream) return std::nullopt;
  const auto encoder = Obtain<IWICBitmapEncoder>(
      [&](IWICBitmapEncoder** made) { return factory->CreateEncoder(GUID_ContainerFormatJpeg, nullptr, made); });
  if (!encoder || FAILED(encoder->Initialize(stream.get(), WICBitmapEncoderNoCache))) return std::nullopt;
  const auto frame = Obtain<IWICBitmapFrameEncode>(
      [&](IWICBitmapFrameEncode** made) { return encoder->CreateNewFrame(made, nullptr); });
  if (!frame || !WriteFrame(frame.get(), pixels) || FAILED(encoder->Commit())) return std::nullopt;
  return ContentOf(stream.get());
}

}  // namespace platform
