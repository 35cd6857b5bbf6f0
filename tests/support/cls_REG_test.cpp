#include "support/cls_REG.h"

#include "tests/falhas.h"

namespace {

using namespace platform::simulated;
using namespace std::string_literals;

constexpr std::uint32_t Raiz = platform::RootCurrentUser;
const std::string Chave = ChaveConfiguracao;
const cls_REG Registro;

class Registros : public testing::Test {
 protected:
  void SetUp() override { Reset(); }
};

TEST_F(Registros, GetValueGivesWhatIsStored) {
  const struct {
    const char* Nome;
    std::uint32_t Tipo;
    std::string Dados;
    Valor Esperado;
  } casos[] = {
      {"text", 1, "Jogo Um\0"s, "Jogo Um"},
      {"empty text", 1, "\0"s, ""},
      {"text without a byte", 1, "", {}},
      {"longest text", 1, std::string(254, 'x') + '\0', std::string(254, 'x')},
      {"too long a text", 1, std::string(255, 'x') + '\0', {}},
      {"number", 4, "\x01\x02\xFF\xFF"s, std::int32_t{-65023}},
      {"number of five bytes", 4, "12345", std::int16_t{0}},
      {"bytes", 3, "\x05\x01"s, std::uint8_t{5}},
      {"no bytes", 3, "", std::uint8_t{0}},
      {"five bytes", 3, "12345", std::int16_t{0}},
      {"text with variables", 2, "%TEMP%\0"s, {}},
      {"several texts", 7, "a\0\0"s, {}},
  };
  for (const auto& caso : casos) {
    PutValue(Chave, caso.Nome, caso.Tipo, caso.Dados);
    EXPECT_EQ(Registro.GetValue(Raiz, Chave, caso.Nome), caso.Esperado) << caso.Nome;
    EXPECT_EQ(Registro.GetValue(Raiz, "\\" + Chave, caso.Nome), caso.Esperado) << caso.Nome;
  }
  EXPECT_EQ(Registro.GetValue(Raiz, Chave, "unknown"), Valor());
  EXPECT_EQ(Registro.GetValue(Raiz, "Software\\Outro", "text"), Valor());
}

TEST_F(Registros, SetValueKeepsTheTypeOfAnExistingValueAndMakesOthersTexts) {
  const struct {
    const char* Nome;
    std::optional<RegistryValue> Antes;
    Valor Novo;
    std::optional<RegistryValue> Depois;
  } casos[] = {
      {"new number", {}, std::int32_t{1}, {{1, "1\0"s}}},
      {"new text", {}, "Jogo Um", {{1, "Jogo Um\0"s}}},
      {"new empty text", {}, "", {{1, "\0"s}}},
      {"text", {{1, "velho\0"s}}, std::int32_t{-7}, {{1, "-7\0"s}}},
      {"too long a text", {{1, std::string(300, 'x')}}, "curto", {{1, "curto\0"s}}},
      {"number from text", {{4, "\x01\0\0\0"s}}, "0", {{4, "\0\0\0\0"s}}},
      {"number from negative text", {{4, "\x01\0\0\0"s}}, " -2 ", {{4, "\xFE\xFF\xFF\xFF"s}}},
      {"number from words", {{4, "\x01\0\0\0"s}}, "um", {{4, "\x01\0\0\0"s}}},
      {"number out of range", {{4, "\x01\0\0\0"s}}, "2147483648", {{4, "\x01\0\0\0"s}}},
      {"byte", {{3, "\x01"s}}, "255", {{3, "\xFF"s}}},
      {"byte out of range", {{3, "\x01"s}}, std::int32_t{256}, {{3, "\x01"s}}},
      {"text with variables", {{2, "%TEMP%\0"s}}, "x", {{2, "%TEMP%\0"s}}},
  };
  for (const auto& caso : casos) {
    if (caso.Antes) PutValue(Chave, caso.Nome, caso.Antes->Type, caso.Antes->Data);
    EXPECT_TRUE(Registro.SetValue(Raiz, Chave, caso.Nome, caso.Novo));
    const auto valor = StoredValue(Chave, caso.Nome);
    ASSERT_TRUE(valor) << caso.Nome;
    EXPECT_EQ(valor->Type, caso.Depois->Type) << caso.Nome;
    EXPECT_EQ(valor->Data, caso.Depois->Data) << caso.Nome;
  }
}

TEST_F(Registros, SetValueCreatesTheWholePath) {
  EXPECT_TRUE(Registro.SetValue(Raiz, "\\" + Chave, "LRom", "Jogo"));
  EXPECT_EQ(StoredText(Chave, "LRom"), "Jogo");
  EXPECT_EQ(Registro.GetValue(Raiz, Chave, "LRom"), Valor("Jogo"));
  DenyKey(Chave);
  EXPECT_TRUE(Registro.SetValue(Raiz, Chave, "LRom", "Outro"));
  EXPECT_EQ(Registro.GetValue(Raiz, Chave, "LRom"), Valor());
  EXPECT_EQ(StoredText(Chave, "LRom"), "Jogo");
}

TEST_F(Registros, SetValueLeavesTheOldOrTheNewValueWhicheverCallFails) {
  for (const bool existe : {false, true}) {
    bool gravado = false;
    const int falhas = ComCadaFalha(
        [&] {
          if (existe) PutText(Chave, "LRom", "velho");
        },
        [&] { EXPECT_TRUE(Registro.SetValue(Raiz, Chave, "LRom", "novo")); },
        [&] {
          const auto texto = StoredText(Chave, "LRom");
          gravado = texto == "novo";
          EXPECT_TRUE(gravado || texto == (existe ? std::optional<std::string>("velho") : std::nullopt));
        });
    EXPECT_TRUE(gravado);
    EXPECT_GE(falhas, 3);
  }
}

TEST_F(Registros, DeletKeyTellsWhetherTheKeyWasThere) {
  PutText("Software\\Roms\\Outro", "a", "b");
  EXPECT_FALSE(Registro.DeletKey(Raiz, ""));
  EXPECT_FALSE(Registro.DeletKey(Raiz, "Software\\Nada"));
  EXPECT_TRUE(Registro.DeletKey(Raiz, "Software\\Roms"));  // stays: it has a key below it
  EXPECT_EQ(StoredText("Software\\Roms\\Outro", "a"), "b");
  EXPECT_TRUE(Registro.DeletKey(Raiz, "Software\\Roms\\Outro"));
  EXPECT_FALSE(Registro.DeletKey(Raiz, "Software\\Roms\\Outro"));
}

TEST_F(Registros, AnotherComputerThatDoesNotAnswerHoldsNothing) {
  EXPECT_TRUE(Registro.SetValue(Raiz, Chave, "LRom", "Jogo", "\\\\OUTRO"));
  EXPECT_EQ(Registro.GetValue(Raiz, Chave, "LRom", "\\\\OUTRO"), Valor());
  EXPECT_FALSE(Registro.DeletKey(Raiz, Chave, "\\\\OUTRO"));
  EXPECT_EQ(StoredValue(Chave, "LRom").has_value(), false);
}

TEST(Valores, AreTextsAndWholeNumbers) {
  const struct {
    Valor Value;
    const char* Texto;
    std::optional<std::int32_t> Inteiro;
  } casos[] = {
      {{}, "", {}},
      {"", "", {}},
      {"  ", "  ", {}},
      {" 12 ", " 12 ", 12},
      {"+3", "+3", 3},
      {"+-3", "+-3", {}},
      {"12a", "12a", {}},
      {"1.5", "1.5", {}},
      {"-2147483648", "-2147483648", -2147483647 - 1},
      {"2147483648", "2147483648", {}},
      {std::uint8_t{200}, "200", 200},
      {std::int16_t{0}, "0", 0},
      {std::int32_t{-5}, "-5", -5},
  };
  for (const auto& caso : casos) {
    EXPECT_EQ(TextoDe(caso.Value), caso.Texto);
    EXPECT_EQ(InteiroDe(caso.Value), caso.Inteiro) << caso.Texto;
  }
}

}  // namespace
