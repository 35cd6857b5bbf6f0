#include "keeper/relato.h"

#include <algorithm>

#include "platform/console.h"
#include "platform/text.h"

namespace {

using platform::Stream;

constexpr std::string_view FimDeLinha = "\r\n";

// "12.3" of bytes and milliseconds; nothing is so fast that it takes no time.
std::string MegabytesPorSegundo(std::int64_t Bytes, std::uint64_t Milissegundos) {
  const auto decimos = Bytes / 100 / static_cast<std::int64_t>(std::max<std::uint64_t>(Milissegundos, 1));
  return std::to_string(decimos / 10) + "." + std::to_string(decimos % 10);
}

}  // namespace

std::string EmColunaDOS(const std::string& NomeDOS) {
  constexpr std::size_t largura = 8;
  return NomeDOS + std::string(2 + largura - std::min(NomeDOS.size(), largura), ' ');
}

void Relato::Linha(const std::string& Texto) { Escrever(false, platform::ToUtf8(Texto)); }

void Relato::Recusar(const std::string& Onde, const std::string& Porque) {
  RecusarUtf8(platform::ToUtf8(Onde), Porque);
}

void Relato::RecusarUtf8(std::string_view Onde, const std::string& Porque) {
  ++recusados_;
  Escrever(true, std::string(Onde) + ": " + platform::ToUtf8(Porque));
}

void Relato::UsoErrado(const std::string& Porque) {
  usoErrado_ = true;
  Escrever(true, "tvk: " + platform::ToUtf8(Porque));
  Escrever(true, platform::ToUtf8(Traduzir(Texto::VejaAAjuda)));
}

void Relato::Escrever(bool Erro, std::string_view Utf8) {
  ApagarAndamento();
  std::string linha(Utf8);
  std::ranges::replace_if(
      linha, [](unsigned char Letra) { return Letra < ' '; }, '?');  // it stays one line
  linha += FimDeLinha;
  if (!platform::WriteStream(Erro ? Stream::Error : Stream::Output, linha)) calado_ = true;
}

void Relato::Comecar(std::size_t Total) {
  total_ = Total;
  feitos_ = 0;
  bytes_ = 0;
  inicio_ = mostrado_ = platform::GetTickCount64();
}

void Relato::Andar(std::int64_t Bytes) {
  constexpr std::uint64_t intervalo = 200;
  ++feitos_;
  bytes_ += Bytes;
  const std::uint64_t agora = platform::GetTickCount64();
  if (agora - mostrado_ >= intervalo && platform::IsConsole(Stream::Error)) MostrarAndamento(agora);
}

void Relato::Terminar() { ApagarAndamento(); }

void Relato::MostrarAndamento(std::uint64_t Agora) {
  ApagarAndamento();
  mostrado_ = Agora;
  const std::string texto = Traduzir(Texto::QuantosFeitos, {std::to_string(feitos_), std::to_string(total_),
                                                            MegabytesPorSegundo(bytes_, Agora - inicio_)});
  largura_ = texto.size();
  platform::WriteStream(Stream::Error, platform::ToUtf8(texto) + "\r");
}

void Relato::ApagarAndamento() {
  if (largura_ > 0) platform::WriteStream(Stream::Error, std::string(largura_, ' ') + "\r");
  largura_ = 0;
}

int Relato::Estado() const {
  if (usoErrado_) return 2;
  return recusados_ > 0 || calado_ ? 1 : 0;
}
