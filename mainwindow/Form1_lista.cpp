// The list of games and the window's busy state.
#include <initializer_list>
#include <utility>

#include "catalog/cls_DAT.h"
#include "collection/jogo.h"
#include "mainwindow/Form1.h"
#include "platform/events.h"
#include "platform/files.h"
#include "platform/keys.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"
#include "support/mod_Traducao.h"
#include "support/textos.h"

namespace {

void CriarDiretoriosQueFaltam() {
  for (const std::string* diretorio : {&DirRoms, &DirSaves, &DirImgs}) {
    if (!DiretorioExiste(*diretorio)) CriarCaminho(*diretorio);
  }
}

void Habilitar(std::initializer_list<platform::Control*> Controles, bool Habilitado) {
  for (platform::Control* controle : Controles) {
    if (controle->Enabled() != Habilitado) controle->Enable(Habilitado);
  }
}

}  // namespace

void Form1::CarregarLista(bool IgnorarUltimo) {
  Desativar(true);
  List1.Select(-1);
  List1.Clear();
  SetCaption(Traduzir(Texto::Carregando));
  platform::RunPendingEvents();
  CriarDiretoriosQueFaltam();
  Catalogo().Atualizar();  // also for an empty list: after the downloader the catalogue is closed until here
  const auto arquivos = platform::ListDirectory(DirRoms, PadraoRoms);
  if (arquivos.empty()) {
    SetCaption(TituloPrograma());
    Image1.SetPicture(Picture1);
    Ativar(true);
    return;
  }
  EncherLista(arquivos);
  if (IgnorarUltimo) {
    Ativar(true);
  } else {
    SelecionarUltimo();
  }
  MostrarImagem();
  SetCaption(TituloPrograma());
}

// The table and the list change together: an event in between may fill both anew.
void Form1::EncherLista(const std::vector<platform::DirectoryEntry>& Arquivos) {
  const std::string dirCurto = CaminhoCurto(DirRoms);
  std::vector<Jogo> novos(Arquivos.size());
  std::vector<std::string> nomes;
  nomes.reserve(Arquivos.size());
  for (std::size_t i = 0; i < Arquivos.size(); ++i) {
    novos[i] = LerJogo(Arquivos[i], dirCurto);
    if (i % 10 == 0) platform::RunPendingEventsAtIntervals();
    if (!novos[i].Arquivo.empty()) nomes.push_back(novos[i].Nome);
  }
  Jogos = std::move(novos);
  List1.Fill(nomes);
}

void Form1::SelecionarUltimo() {
  const std::string ultimo = LerTexto("LRom");
  if (ultimo.empty()) {
    Ativar(true);
    return;
  }
  SelecionarNome(ultimo);
  Ativar(false);
}

void Form1::SelecionarNome(const std::string& Nome) {
  const int indice = List1.FindExact(Nome);
  List1.Select(indice);
  if (indice >= 0) List1_Click();
}

void Form1::Desativar(bool Total) {
  Habilitar({&Command1, &Command2, &Command3, &Command4, &Command5, &Command6, &Check1}, false);
  if (Total) {
    Habilitar({&List1}, false);
    if (Image1.Visible()) Image1.Show(false);
  }
  platform::RunPendingEvents();
}

void Form1::Ativar(bool NemTudo) {
  if (List1.Selected() == -1) NemTudo = true;
  if (!NemTudo) Habilitar({&Command1, &Command5, &Command6}, true);
  Habilitar({&Command2, &Command3, &Command4, &Check1, &List1}, true);
  if (!Image1.Visible()) Image1.Show(true);
  List1.SetFocus();
  platform::RunPendingEvents();
}

bool Form1::InList1(const std::string& Entrada) const { return List1.FindExact(Entrada) != -1; }

void Form1::List1_Click() {
  if (!List1.Enabled()) {
    Image1.SetPicture(Picture1);
    return;
  }
  MostrarImagem();
  Ativar(false);
}

void Form1::List1_DblClick() {
  if (Command1.Enabled()) Command1_Click();
}

void Form1::List1_KeyDown(int KeyCode) {
  if (KeyCode == platform::KeyEnter && Command1.Enabled()) Command1_Click();
}

void Form1::Timer1_Tick() {
  if (!Enabled()) return;
  Timer1.Enable(false);
  CarregarLista(false);
}
