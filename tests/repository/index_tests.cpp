#include "repository/figura.h"
#include "repository/indice.h"
#include "tests/contract/small_pictures.h"
#include "tests/repository/repository.h"

namespace {

// A stanza of a game with nothing but what it has to have.
std::string Stanza(const std::string& name, const std::string& dosName) {
  return "Nome: " + name + "\nNomeDOS: " + dosName + "\nPacote: " + Hash + " 1\n";
}

TEST(Index, IsWrittenInOrderAndReadBack) {
  const std::vector<JogoPublicado> games = {
      {"Zebra", "ZEBRA", {Hash, 6}, {}, "", "", "", "", ""},
      {"Última", "ULTIMA", {Hash, 5}, {Hash, 43}, "gif", "Ana", "Livre", "Um jogo: dela", "1.0"},
      {"abelha", "ABELHA", {Hash, 7}, {Hash, 44}, "jpg", "", "", "", "2"},
  };
  const std::string text = EscreverIndice(games);
  EXPECT_EQ(text, "Nome: Zebra\nNomeDOS: ZEBRA\nPacote: " + Hash + " 6\n\n" +
                      "Nome: abelha\nNomeDOS: ABELHA\nPacote: " + Hash + " 7\nFigura: " + Hash +
                      " 44 jpg\nVersao: 2\n\n" + "Nome: Última\nNomeDOS: ULTIMA\nPacote: " + Hash + " 5\nFigura: " +
                      Hash + " 43 gif\nAutor: Ana\nLicenca: Livre\nDescricao: Um jogo: dela\nVersao: 1.0\n");
  const IndiceLido read = LerIndice(text);
  EXPECT_EQ(InWords(read.Porque), "");
  EXPECT_EQ(read.Jogos, (std::vector{games[0], games[2], games[1]}));
}

TEST(Index, KeepsEveryRule) {
  const std::string whole = Stanza("Beta", "BETA") + "\n" + Stanza("Gama", "GAMA");
  const struct {
    const char* Name;
    std::string Content, Refusal;
  } cases[] = {
      {"two games", whole, ""},
      {"no game", "", ""},
      {"an unknown key", With(whole, "Pacote", "Novo: 1\nPacote"), ""},
      {"more than 16 MiB", std::string((16 << 20) + 1, '\n'), "too large"},
      {"two empty lines", With(whole, "\n\n", "\n\n\n"), "empty line 5"},
      {"no empty line", With(whole, "\n\n", "\n"), "key twice 4 Nome"},
      {"an empty line at the end", whole + "\n", "empty line 8"},
      {"not in order", Stanza("Gama", "GAMA") + "\n" + Stanza("Beta", "BETA"), "not in order 5 Nome"},
      {"in the order of the language only", Stanza("Água", "AGUA") + "\n" + Stanza("Zebra", "ZEBRA"),
       "not in order 5 Nome"},
      {"a name twice", Stanza("Beta", "BETA") + "\n" + Stanza("Beta", "BETA2"), "same name 5 Nome"},
      {"a name in other letter case", Stanza("BÊTA ŠŸŒŽÞ", "BETA") + "\n" + Stanza("bêta šÿœžþ", "BETA2"),
       "same name 5 Nome"},
      {"names that differ in a sign", Stanza("×", "A") + "\n" + Stanza("÷", "B"), ""},
      {"a DOS name twice", Stanza("Beta", "BETA") + "\n" + Stanza("Gama", "BETA"), "same name 6 NomeDOS"},
      {"no name", With(whole, "Nome: Gama\n", ""), "no key 5 Nome"},
      {"no DOS name", With(whole, "NomeDOS: GAMA\n", ""), "no key 5 NomeDOS"},
      {"no package", With(whole, "Pacote", "Pacotes"), "no key 1 Pacote"},
      {"a name for the catalogue", With(whole, "Gama", "Ga|ma"), "wrong value 5 Nome"},
      {"a name outside the code page", With(whole, "Gama", "日本"), "wrong value 5 Nome"},
      {"a name that leads out", With(whole, "Gama", "..\\Gama"), "wrong value 5 Nome"},
      {"a device", With(whole, "NomeDOS: GAMA", "NomeDOS: CON"), "wrong value 6 NomeDOS"},
      {"a short name's form", With(whole, "NomeDOS: GAMA", "NomeDOS: GAMA~1"), "wrong value 6 NomeDOS"},
      {"a package of 256 MiB", With(whole, " 1\n", " 268435456\n"), ""},
      {"a larger package", With(whole, " 1\n", " 268435457\n"), "wrong value 3 Pacote"},
      {"a picture of 1 MiB", whole + "Figura: " + Hash + " 1048576 bmp\n", ""},
      {"a larger picture", whole + "Figura: " + Hash + " 1048577 bmp\n", "wrong value 8 Figura"},
      {"another type of picture", whole + "Figura: " + Hash + " 1 png\n", "wrong value 8 Figura"},
      {"no type of picture", whole + "Figura: " + Hash + " 1\n", "wrong value 8 Figura"},
      {"an empty text", whole + "Autor: \n", "wrong line 8"},
  };
  for (const auto& [name, content, refusal] : cases) EXPECT_EQ(InWords(LerIndice(content).Porque), refusal) << name;
}

TEST(Pictures, OfARepositoryAreSmallAndWhatTheirExtensionSays) {
  const struct {
    const char* Name;
    std::string Content;
    const char* Extension;
    FaltaNaFigura Fault;
  } cases[] = {
      {"a GIF", contract::SmallGif(), "gif", FaltaNaFigura::Nenhuma},
      {"a BMP", contract::SmallBmp(), "bmp", FaltaNaFigura::Nenhuma},
      {"a JPEG", contract::SmallJpeg(), "jpg", FaltaNaFigura::Nenhuma},
      {"a PNG", contract::SmallPng(), "png", FaltaNaFigura::OutroTipo},
      {"another extension", contract::SmallGif(), "jpg", FaltaNaFigura::OutroTipo},
      {"no picture", "GIF89a", "gif", FaltaNaFigura::OutroTipo},
      {"none that has no extension", "", "", FaltaNaFigura::OutroTipo},
      {"of 1 MiB", contract::SmallGif() + std::string((1 << 20) - 43, 'x'), "gif", FaltaNaFigura::Nenhuma},
      {"a byte more", contract::SmallGif() + std::string((1 << 20) - 42, 'x'), "gif", FaltaNaFigura::Grande},
      {"of 4 megapixels", contract::SmallJpeg({2'000, 2'000}) + std::string(8'000, 'x'), "jpg", FaltaNaFigura::Nenhuma},
      {"a pixel row more", contract::SmallJpeg({2'000, 2'001}) + std::string(8'000, 'x'), "jpg",
       FaltaNaFigura::PontosDemais},
  };
  for (const auto& [name, content, extension, fault] : cases) {
    EXPECT_EQ(ConferirFigura(content, extension), fault) << name;
  }
}

}  // namespace
