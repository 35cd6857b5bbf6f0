#include "support/cls_REG.h"
#include "tests/fresh_machine.h"

namespace {

constexpr std::uint32_t Raiz = platform::RootCurrentUser;
const std::string Chave = ChaveConfiguracao;
const cls_REG Registro;

struct Registros : FreshMachine {};

TEST_F(Registros, AValueIsReadByItsTypeAndKeepsItWhenItIsSet) {
  const std::string um = "\x01\0\0\0"s, longo(254, 'x');
  using Guardado = std::optional<RegistryValue>;
  const std::tuple<const char*, Guardado, Valor, Valor, RegistryValue> casos[] = {
      // before, what is read, what is set, after
      {"nothing", {}, {}, std::int32_t{1}, {1, "1\0"s}},
      {"text", {{1, "Jogo Um\0"s}}, "Jogo Um", std::int32_t{-7}, {1, "-7\0"s}},
      {"text without a byte", {{1, ""}}, {}, "novo", {1, "novo\0"s}},
      {"longest text", {{1, longo + '\0'}}, longo, "curto", {1, "curto\0"s}},
      {"too long a text", {{1, longo + "x\0"s}}, {}, "curto", {1, "curto\0"s}},
      {"number", {{4, "\x01\x02\xFF\xFF"s}}, std::int32_t{-65023}, " -2 ", {4, "\xFE\xFF\xFF\xFF"s}},
      {"number, then words", {{4, um}}, std::int32_t{1}, "um", {4, um}},
      {"number of five bytes", {{4, "12345"}}, std::int16_t{0}, "1", {4, um}},
      {"bytes", {{3, "\x05\x01"s}}, std::uint8_t{5}, "255", {3, "\xFF"s}},
      {"no bytes, then too large a one", {{3, ""}}, std::uint8_t{0}, std::int32_t{256}, {3, ""}},
      {"five bytes, then a negative one", {{3, "12345"}}, std::int16_t{0}, "-1", {3, "12345"}},
      {"text with variables", {{2, "%TEMP%\0"s}}, {}, "7", {2, "%TEMP%\0"s}},
  };
  for (const auto& [nome, antes, lido, novo, depois] : casos) {
    if (antes) PutValue(Chave, nome, antes->Type, antes->Data);
    EXPECT_EQ(Registro.GetValue(Raiz, "\\" + Chave, nome), lido) << nome;
    EXPECT_TRUE(Registro.SetValue(Raiz, "\\" + Chave, nome, novo));
    const auto valor = StoredValue(Chave, nome).value_or(RegistryValue());
    EXPECT_TRUE(valor.Type == depois.Type && valor.Data == depois.Data) << nome;
  }
  EXPECT_EQ(Registro.GetValue(Raiz, "Software\\Outro", "text"), Valor());
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

TEST(Valores, AreWholeNumbersOf32BitsOrNone) {
  const std::pair<const char*, std::optional<std::int32_t>> textos[] = {{"", {}},
                                                                        {"  ", {}},
                                                                        {" 12 ", 12},
                                                                        {"+3", 3},
                                                                        {"+-3", {}},
                                                                        {"12a", {}},
                                                                        {"-2147483648", -2147483647 - 1},
                                                                        {"2147483648", {}}};
  for (const auto& [texto, inteiro] : textos) EXPECT_EQ(InteiroDe(texto), inteiro) << texto;
  EXPECT_EQ(TextoDe(std::uint8_t{200}) + TextoDe(std::int16_t{-200}) + TextoDe({}), "200-200");
}

}  // namespace
