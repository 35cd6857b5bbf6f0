// The two commands that lead out of the window: the downloader and the save-file manager.
#include "catalog/cls_DAT.h"
#include "mainwindow/Form1.h"
#include "savemanager/Form4.h"
#include "support/mensagens.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"
#include "support/mod_exe.h"

// The window stays inactive, and the catalogue closed, until the downloader enables the window by its handle.
void Form1::Command3_Click() {
  const std::string Downloader = DirPrograma + "tolvarisdownload.exe";
  if (!ArquivoExiste(Downloader)) {
    MostrarMensagem(Mensagem::SemDownloader);
    return;
  }
  const std::string Selecionado = NomeSelecionado();
  Desativar(false);
  Enable(false);
  SetCaption("...");
  List1.Select(-1);
  Catalogo().Fechar();
  const std::string Identificadores = std::to_string(Handle()) + "@" + std::to_string(List1.Handle());
  std::string Diretorio = DirPrograma;
  if (ExecutarPrograma(Downloader + " " + Identificadores, 100, false, 2, Diretorio)) {
    Timer1.Enable(true);
    return;
  }
  Enable(true);
  CarregarLista(true);
  SelecionarNome(Selecionado);
}

void Form1::Command2_Click() {
  if (EsperarDisquete()) Form4::Mostrar();
}
