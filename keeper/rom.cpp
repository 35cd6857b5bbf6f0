#include "keeper/rom.h"

#include <utility>

#include "platform/text.h"
#include "support/caminhos.h"
#include "support/textos.h"

namespace {

constexpr std::size_t SemSoma = 1'048'576;  // bytes; a multiple of it has no checksum

// Memory chips have sizes of many KiB; some copiers put 512 bytes before them.
bool PareceRom(std::string_view Conteudo) {
  constexpr std::size_t bloco = 32'768, cabecalho = 512;
  return Conteudo.size() % bloco == 0 || Conteudo.size() % bloco == cabecalho;
}

std::string NomeDentro(const std::string& Arquivo) {
  const std::string nome = UltimaParte(Arquivo);
  const std::string dentro = TipoDoArquivo(nome) == "SMC" ? nome : NomeBase(nome).value_or(nome) + ".smc";
  return platform::ToUtf8(dentro);
}

}  // namespace

bool EhRom(const std::string& Arquivo) {
  const std::string nome = UltimaParte(Arquivo), tipo = TipoDoArquivo(nome);
  const bool conhecido = tipo == "ZIP" || tipo == "SMC" || tipo == "SFC";
  return conhecido && nome.size() > 4 && nome[nome.size() - 4] == '.';
}

// An import gives every game's file the name of an archive, whatever it holds.
RomPronta PrepararRom(const std::string& Arquivo, std::string Conteudo) {
  const bool zip = PareceZip(Conteudo);
  if (zip ? !FimDoZip(Conteudo) : TipoDoArquivo(Arquivo) == "ZIP" && !PareceRom(Conteudo)) {
    return {"", Traduzir(Texto::ZipDanificado)};
  }
  auto pronto = zip ? std::optional(std::move(Conteudo)) : FazerZip(NomeDentro(Arquivo), Conteudo);
  if (!pronto) return {"", Traduzir(Texto::SemMemoria)};
  if (pronto->size() % SemSoma == 0 && !AlongarComentario(*pronto)) return {"", Traduzir(Texto::ZipDanificado)};
  return {std::move(*pronto), ""};
}
