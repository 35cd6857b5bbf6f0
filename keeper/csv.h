// Tables as RFC 4180 has them, with a line of column names.
#pragma once

#include <cstddef>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

// A line of a table, without its line end; fields are quoted where they have to be.
std::string LinhaCsv(std::initializer_list<std::string_view> Campos);

struct LinhaDaTabela {
  std::size_t Numero = 0;           // of its first line in the file, from 1
  std::vector<std::string> Campos;  // without quotes
};

// A table's lines one after the other. Fields are parted by ";" or ",": the one that the first line has, outside
// quotes, first. Lines end with CR LF, LF or CR; the empty ones are passed over.
class LeitorCsv {
 public:
  explicit LeitorCsv(std::string_view Conteudo);

  // The next line; nothing at the end, and for good where a quote has no end or stands in the middle of a field.
  std::optional<LinhaDaTabela> Proxima();

  std::size_t LinhaErrada() const { return errada_; }  // 0: none

 private:
  std::optional<std::string> Campo();
  std::optional<std::string> CampoEntreAspas();
  void PularFimDeLinha();
  bool NoFim() const { return posicao_ == conteudo_.size(); }
  bool NoFimDaLinha() const { return NoFim() || conteudo_[posicao_] == '\r' || conteudo_[posicao_] == '\n'; }

  std::string_view conteudo_;
  std::size_t posicao_ = 0, linha_ = 1, errada_ = 0;
  char separador_;
};
