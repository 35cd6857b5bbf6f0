#include "support/cls_REG.h"
#include "tests/falhas.h"

namespace {

using namespace platform::simulated;
using namespace std::string_literals;

constexpr std::uint32_t Raiz = platform::RootCurrentUser;
const std::string Chave = ChaveConfiguracao;
const cls_REG Registro;

struct Registros : testing::Test {
  void SetUp() override { Reset(); }
};

TEST_F(Registros, AValueIsReadByItsTypeAndKeepsItWhenItIsSet) {
  const std::string um = "\x01\0\0\0"s, longo(254, 'x');
  const struct {
    const char* Nome;
    std::optional<RegistryValue> Antes;
    Valor Lido, Novo;
    RegistryValue Depois;
  } casos[] = {
      {"nothing", {}, {}, std::int32_t{1}, {1, "1\0"s}},
      {"text", {{1, "Jogo Um\0"s}}, "Jogo Um", std::int32_t{-7}, {1, "-7\0"s}},
      {"empty text", {{1, "\0"s}}, "", "Jogo Um", {1, "Jogo Um\0"s}},
      {"text without a byte", {{1, ""}}, {}, "novo", {1, "novo\0"s}},
      {"longest text", {{1, longo + '\0'}}, longo, "curto", {1, "curto\0"s}},
      {"too long a text", {{1, longo + "x\0"s}}, {}, "curto", {1, "curto\0"s}},
      {"number", {{4, "\x01\x02\xFF\xFF"s}}, std::int32_t{-65023}, " -2 ", {4, "\xFE\xFF\xFF\xFF"s}},
      {"number, then words", {{4, um}}, std::int32_t{1}, "um", {4, um}},
      {"number, then too large a one", {{4, um}}, std::int32_t{1}, "2147483648", {4, um}},
      {"number of five bytes", {{4, "12345"}}, std::int16_t{0}, "1", {4, um}},
      {"bytes", {{3, "\x05\x01"s}}, std::uint8_t{5}, "255", {3, "\xFF"s}},
      {"no bytes, then too large a one", {{3, ""}}, std::uint8_t{0}, std::int32_t{256}, {3, ""}},
      {"five bytes, then a negative one", {{3, "12345"}}, std::int16_t{0}, "-1", {3, "12345"}},
      {"text with variables", {{2, "%TEMP%\0"s}}, {}, "x", {2, "%TEMP%\0"s}},
  };
  for (const auto& caso : casos) {
    if (caso.Antes) PutValue(Chave, caso.Nome, caso.Antes->Type, caso.Antes->Data);
    EXPECT_EQ(Registro.GetValue(Raiz, Chave, caso.Nome), caso.Lido) << caso.Nome;
    EXPECT_EQ(Registro.GetValue(Raiz, "\\" + Chave, caso.Nome), caso.Lido) << caso.Nome;
    EXPECT_TRUE(Registro.SetValue(Raiz, "\\" + Chave, caso.Nome, caso.Novo));
    const auto valor = StoredValue(Chave, caso.Nome);
    EXPECT_TRUE(valor && valor->Type == caso.Depois.Type && valor->Data == caso.Depois.Data) << caso.Nome;
  }
  EXPECT_EQ(Registro.GetValue(Raiz, "Software\\Outro", "text"), Valor());
}

TEST_F(Registros, SetValueLeavesTheOldOrTheNewValueWhicheverCallFails) {
  for (const auto& antes : {std::optional<std::string>(), std::optional("velho"s)}) {
    std::optional<std::string> texto;
    const auto preparar = [&] { antes ? PutText(Chave, "LRom", *antes) : void(); };
    const auto conferir = [&] {
      texto = StoredText(Chave, "LRom");
      EXPECT_TRUE(texto == "novo" || texto == antes);
    };
    EXPECT_GE(ComCadaFalha(
                  preparar, [] { EXPECT_TRUE(Registro.SetValue(Raiz, Chave, "LRom", "novo")); }, conferir),
              3);
    EXPECT_EQ(texto, "novo");
  }
}

TEST_F(Registros, WhatCannotBeReachedHoldsNothingAndStays) {
  PutText(Chave, "LRom", "Jogo");
  for (const std::string computador : {"\\\\OUTRO", ""}) {
    if (computador.empty()) DenyKey(Chave);
    EXPECT_TRUE(Registro.SetValue(Raiz, Chave, "LRom", "Outro", computador));
    EXPECT_EQ(Registro.GetValue(Raiz, Chave, "LRom", computador), Valor());
    EXPECT_FALSE(Registro.DeletKey(Raiz, Chave, computador));
    EXPECT_EQ(StoredText(Chave, "LRom"), "Jogo");
  }
}

// A key with another one below it stays.
TEST_F(Registros, DeletKeyTellsWhetherTheKeyWasThere) {
  PutText("Software\\Roms\\Um", "a", "b");
  const std::string roms = "Software\\Roms", um = roms + "\\Um";
  const std::pair<std::string, bool> passos[] = {
      {"", false}, {roms + "\\Dois", false}, {roms, true}, {um, true}, {um, false}, {roms, true}, {roms, false}};
  for (const auto& [chave, estava] : passos) EXPECT_EQ(Registro.DeletKey(Raiz, chave), estava) << chave;
}

TEST(Valores, AreTextsAndWholeNumbers) {
  constexpr std::optional<std::int32_t> Nada;
  const std::pair<const char*, std::optional<std::int32_t>> textos[] = {
      {"", Nada},           {"  ", Nada},  {" 12 ", 12},  {"+3", 3},
      {"+-3", Nada},        {"12a", Nada}, {"1.5", Nada}, {"-2147483648", -2147483647 - 1},
      {"2147483648", Nada},
  };
  for (const auto& [texto, inteiro] : textos) {
    EXPECT_EQ(InteiroDe(texto), inteiro) << texto;
    EXPECT_EQ(TextoDe(texto), texto);
  }
  for (const Valor& valor : {Valor(std::uint8_t{200}), Valor(std::int16_t{200}), Valor(std::int32_t{200})}) {
    EXPECT_EQ(InteiroDe(valor), 200);
    EXPECT_EQ(TextoDe(valor), "200");
  }
  EXPECT_EQ(InteiroDe({}), Nada);
  EXPECT_EQ(TextoDe({}), "");
}

}  // namespace
