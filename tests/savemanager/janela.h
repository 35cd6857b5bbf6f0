// What the tests of the save-file manager's window share: a machine with games, saves and a floppy disk.
#pragma once

#include <gtest/gtest.h>

#include "catalog/cls_DAT.h"
#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "savemanager/Form4.h"
#include "support/mod_Globais.h"

// Saves: one on the floppy, one on the computer, and one on both.
struct Salvamentos : testing::Test {
  void SetUp() override { Preparar(); }

  static void Preparar() {
    using namespace platform::simulated;
    Catalogo().Fechar();
    Reset();
    AddDisk('A', 1457664);
    DirPrograma = "C:\\Tolvaris\\";
    DirSaves = "C:\\Saves\\";
    ArquivoIdioma.clear();
    PutFile("C:\\Tolvaris\\tolvaris.dat", "|UM=Jogo Um||DOIS=Corrida 2||A=Igual||B=Igual||ACAO=Ação|"_ansi);
    PutFile("A:\\UM.srm", "um no disquete");
    PutFile("A:\\DOIS.zst", "velho no disquete");
    PutFile("C:\\Saves\\DOIS.zst", "novo no computador");
    PutFile("C:\\Saves\\SEMNOME.zs2", "sem nome no computador");
    Catalogo().Carregar();
  }

  // Opens the window with this user in front of it.
  static void Abrir(const std::function<void(Form4&)>& usuario) {
    int vezes = 0;
    platform::simulated::QueueModal([&](platform::Window& janela) { ++vezes, usuario(static_cast<Form4&>(janela)); });
    Form4::Mostrar();
    EXPECT_EQ(vezes, 1);
  }

  static std::string Textos(const platform::ListBox& lista) {
    std::string textos;
    for (int i = 0; i < lista.Count(); ++i) textos += lista.Text(i) + "|";
    return textos;
  }

  static void Escolher(platform::ListBox& lista, const std::string& texto) {
    ASSERT_GE(lista.FindExact(texto), 0) << texto;
    platform::simulated::Choose(lista, lista.FindExact(texto));
  }

  static bool NadaEscolhido(const Form4& janela) {
    return janela.Direcao == Origem::Nenhuma && janela.List1.Selected() < 0 && janela.List2.Selected() < 0 &&
           !janela.Image1.Visible() && !janela.Image2.Visible() && !janela.Command1.Visible();
  }
};

using Mensagens = std::vector<platform::simulated::ShownMessage>;
