#include "keeper/diario.h"

#include <array>
#include <charconv>
#include <cstdint>
#include <cstdio>
#include <iterator>

#include "package/crc32.h"
#include "package/pacote.h"

namespace {

constexpr std::string_view PrimeiraLinha = "tvk nomear 1\r\n", Quebra = "\r\n";

std::string SomaDe(std::string_view Texto) {
  std::array<char, 16> soma{};
  std::snprintf(soma.data(), soma.size(), "%08X", static_cast<unsigned>(~CRC32::Atualizar(CRC32::Inicial, Texto)));
  return soma.data() + std::string(Quebra);
}

std::int64_t TamanhoDe(const TextoDoCatalogo& Texto) { return Texto ? std::ssize(*Texto) : -1; }

// Goes through the text; what is not as it should be makes it wrong for good.
class LeitorDeDiario {
 public:
  explicit LeitorDeDiario(std::string_view Texto) : resto_(Texto) {}

  std::int64_t Numero(std::string_view Fim) {
    const std::string_view texto = Ate(Fim);
    std::int64_t numero = 0;
    const auto [lido, erro] = std::from_chars(texto.data(), texto.data() + texto.size(), numero);
    certo_ = certo_ && erro == std::errc() && lido == texto.data() + texto.size();
    return numero;
  }

  std::string Nome(std::string_view Fim) {
    const std::string_view nome = Ate(Fim);
    certo_ = certo_ && NomeSeguro(nome);
    return std::string(nome);
  }

  TextoDoCatalogo Catalogo(std::int64_t Tamanho) {
    if (Tamanho == -1) return std::nullopt;
    certo_ = certo_ && Tamanho >= 0 && Tamanho <= std::ssize(resto_);
    return certo_ ? std::string(Tirar(static_cast<std::size_t>(Tamanho))) : std::string();
  }

  bool Certo() const { return certo_; }
  bool NoFim() const { return resto_.empty(); }

 private:
  std::string_view Ate(std::string_view Fim) {
    const std::size_t fim = resto_.find(Fim);
    certo_ = certo_ && fim != std::string_view::npos;
    if (!certo_) return {};
    const std::string_view lido = Tirar(fim);
    Tirar(Fim.size());
    return lido;
  }

  std::string_view Tirar(std::size_t Quantos) {
    const std::string_view tirado = resto_.substr(0, Quantos);
    resto_.remove_prefix(Quantos);
    return tirado;
  }

  std::string_view resto_;
  bool certo_ = true;
};

std::string LinhaDe(const FiguraMudada& Qual) {
  return std::to_string(Qual.Conteudo.Tamanho) + " " + std::to_string(Qual.Conteudo.Soma) + " " + Qual.De + "|" +
         Qual.Provisorio + "|" + Qual.Para + std::string(Quebra);
}

FiguraMudada LerFigura(LeitorDeDiario& Texto) {
  FiguraMudada figura;
  figura.Conteudo.Tamanho = Texto.Numero(" ");
  figura.Conteudo.Soma = static_cast<std::uint32_t>(Texto.Numero(" "));
  figura.De = Texto.Nome("|");
  figura.Provisorio = Texto.Nome("|");
  figura.Para = Texto.Nome(Quebra);
  return figura;
}

}  // namespace

std::string EmTexto(const Mudanca& Qual) {
  std::string texto = std::string(PrimeiraLinha) + std::to_string(TamanhoDe(Qual.Antes)) + " " +
                      std::to_string(TamanhoDe(Qual.Depois)) + " " + std::to_string(Qual.Figuras.size());
  texto += Quebra;
  for (const FiguraMudada& cada : Qual.Figuras) texto += LinhaDe(cada);
  texto += Qual.Antes.value_or("") + Qual.Depois.value_or("");
  texto += Quebra;
  return texto + SomaDe(texto);
}

std::optional<Mudanca> DeTexto(std::string_view Texto) {
  const std::size_t tamanhoDaSoma = SomaDe("").size();
  if (!Texto.starts_with(PrimeiraLinha) || Texto.size() < PrimeiraLinha.size() + tamanhoDaSoma) return std::nullopt;
  const std::string_view soma = Texto.substr(Texto.size() - tamanhoDaSoma);
  Texto.remove_suffix(tamanhoDaSoma);
  if (SomaDe(Texto) != soma) return std::nullopt;
  LeitorDeDiario leitor(Texto.substr(PrimeiraLinha.size()));
  const std::int64_t antes = leitor.Numero(" "), depois = leitor.Numero(" "), figuras = leitor.Numero(Quebra);
  Mudanca lida;
  for (std::int64_t i = 0; i < figuras && leitor.Certo(); ++i) lida.Figuras.push_back(LerFigura(leitor));
  lida.Antes = leitor.Catalogo(antes);
  lida.Depois = leitor.Catalogo(depois);
  leitor.Nome(Quebra);
  if (!leitor.Certo() || !leitor.NoFim() || !lida.Depois || lida.Depois->empty()) return std::nullopt;
  return lida;
}
