// The one gate through which files of strangers come in: nothing here trusts what it reads.
#include <array>
#include <cstddef>
#include <limits>
#include <utility>
#include <variant>

#include "package/pacote.h"
#include "platform/text.h"
#include "support/brancos.h"

namespace {

constexpr std::string_view Assinatura = "TOLVARIS";
constexpr std::string_view Marcador = "|IMGROMDAT|";
constexpr std::size_t MaiorCabecalho = 10'240;  // bytes, the marker included

// The keys as they are searched: in the header in upper case.
constexpr std::array<std::string_view, 7> Chaves = {"NOME=", "NOMEDOS=", "CRC=", "IIMG=", "TIMG=", "IROM=", "TROM="};

struct Cabecalho {
  std::string_view Original;  // up to the end of the marker
  std::string Maiusculas;     // the same in upper case
};

std::optional<Cabecalho> AcharCabecalho(std::string_view Conteudo) {
  std::string maiusculas = platform::CharUpperBuffA(std::string(Conteudo.substr(0, MaiorCabecalho)));
  if (!maiusculas.starts_with(Assinatura)) return std::nullopt;
  const std::size_t marcador = maiusculas.find(Marcador);
  if (marcador == std::string::npos) return std::nullopt;
  maiusculas.resize(marcador + Marcador.size());
  return Cabecalho{Conteudo.substr(0, maiusculas.size()), std::move(maiusculas)};
}

// From the first place where the key stands, wherever that is, to the end of its line.
std::optional<std::string_view> AcharValor(const Cabecalho& Onde, std::string_view Chave) {
  const std::size_t inicio = Onde.Maiusculas.find(Chave);
  if (inicio == std::string::npos) return std::nullopt;
  const std::size_t fim = Onde.Maiusculas.find("\r\n", inicio);
  if (fim == std::string::npos) return std::nullopt;
  return Onde.Original.substr(inicio + Chave.size(), fim - inicio - Chave.size());
}

// Plain digits with blanks around them, from 1 to the largest signed 32-bit number.
std::optional<std::int64_t> LerNumero(std::string_view Texto) {
  std::int64_t numero = 0;
  for (const char digito : SemBrancos(Texto, " \t")) {
    if (digito < '0' || digito > '9') return std::nullopt;
    numero = numero * 10 + (digito - '0');
    if (numero > std::numeric_limits<std::int32_t>::max()) return std::nullopt;
  }
  return numero >= 1 ? std::optional(numero) : std::nullopt;
}

// The block that starts so many bytes after the end of the header (1: right after it), as far as the content goes.
std::string_view Bloco(std::string_view Conteudo, std::size_t FimCabecalho, std::int64_t Deslocamento,
                       std::int64_t Tamanho) {
  const std::int64_t inicio = static_cast<std::int64_t>(FimCabecalho) + Deslocamento - 1;
  if (inicio >= static_cast<std::int64_t>(Conteudo.size())) return {};
  return Conteudo.substr(static_cast<std::size_t>(inicio), static_cast<std::size_t>(Tamanho));
}

using Leitura = std::variant<DefeitoDoPacote, Pacote>;

Leitura Ler(std::string_view Conteudo) {
  const std::optional<Cabecalho> cabecalho = AcharCabecalho(Conteudo);
  if (!cabecalho) return DefeitoDoPacote::SemCabecalho;
  std::array<std::string_view, Chaves.size()> valores;
  for (std::size_t i = 0; i < Chaves.size(); ++i) {
    const std::optional<std::string_view> valor = AcharValor(*cabecalho, Chaves[i]);
    if (!valor) return DefeitoDoPacote::SemChave;
    valores[i] = *valor;
  }
  const auto& [nome, dosName, crc, iImg, tImg, iRom, tRom] = valores;
  if (!NomeSeguro(nome) || !NomeSeguro(dosName)) return DefeitoDoPacote::NomeInseguro;
  const auto inicioImagem = LerNumero(iImg), tamanhoImagem = LerNumero(tImg);
  const auto inicioRom = LerNumero(iRom), tamanhoRom = LerNumero(tRom);
  if (!inicioImagem || !tamanhoImagem || !inicioRom || !tamanhoRom) return DefeitoDoPacote::NumeroErrado;
  const std::size_t fim = cabecalho->Original.size();
  return Pacote{std::string(nome), std::string(dosName), std::string(crc),
                Bloco(Conteudo, fim, *inicioImagem, *tamanhoImagem), Bloco(Conteudo, fim, *inicioRom, *tamanhoRom)};
}

}  // namespace

std::optional<Pacote> LerPacote(std::string_view Conteudo) {
  Leitura lido = Ler(Conteudo);
  auto* pacote = std::get_if<Pacote>(&lido);
  return pacote != nullptr ? std::optional(std::move(*pacote)) : std::nullopt;
}

DefeitoDoPacote DefeitoDe(std::string_view Conteudo) {
  const Leitura lido = Ler(Conteudo);
  const auto* defeito = std::get_if<DefeitoDoPacote>(&lido);
  return defeito != nullptr ? *defeito : DefeitoDoPacote::Nenhum;
}
