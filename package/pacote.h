// The game package (*.tvk): one file that carries a game's name, its DOS name, the checksum of its ROM, its picture and
// its ROM. Bytes in, bytes out; docs/package.md describes the format.
#pragma once

#include <concepts>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

// What a package holds. The two blocks are parts of the content that was read, not copies of it: they are good for as
// long as that content is.
struct Pacote {
  std::string Nome, DOSName;
  std::string CRC;  // decimal text, not compared with the ROM
  std::string_view Imagem, Rom;
};

// The bytes of a package. The lengths are written as they are given, whatever the blocks hold. Names go in as they
// stand: one with a line break in it, or with one of the header's keys, makes a package that reads differently.
std::string MontarPacote(std::string_view Nome, std::string_view DOSName, std::string_view CRC,
                         std::int64_t TamanhoImagem, std::int64_t TamanhoRom, std::string_view Imagem,
                         std::string_view Rom);

// What a package file's content holds; nothing when it is no package, or one of whose names cannot name a file
// (NomeSeguro). Blocks that the content is too short for are cut short.
std::optional<Pacote> LerPacote(std::string_view Conteudo);

// Not for a content that is gone before the blocks are used.
template <std::same_as<std::string> Passageiro>
std::optional<Pacote> LerPacote(Passageiro&& Conteudo) = delete;

// Why LerPacote gives nothing for a content.
enum class DefeitoDoPacote {
  Nenhum,
  SemCabecalho,  // not the first word of a package, or no marker within the length that a header may have
  SemChave,
  NumeroErrado,
  NomeInseguro
};
DefeitoDoPacote DefeitoDe(std::string_view Conteudo);

// Whether this name and an extension make the name of a plain file in whichever directory they are appended to. False
// for what would lead elsewhere: a path separator, a drive or stream (":"), a control character, a device (CON, NUL,
// COM1, ...). True for the empty name, and for what the platform refuses by itself when the file is created.
bool NomeSeguro(std::string_view Nome);
