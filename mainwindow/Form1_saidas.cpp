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
  const std::string downloader = DirPrograma + "tolvarisdownload.exe";
  if (!ArquivoExiste(downloader)) {
    MostrarMensagem(Mensagem::SemDownloader);
    return;
  }
  const std::string selecionado = NomeSelecionado();
  Desativar(false);
  Enable(false);
  SetCaption("...");
  List1.Select(-1);
  Catalogo().Fechar();
  const std::string identificadores = std::to_string(Handle()) + "@" + std::to_string(List1.Handle());
  std::string diretorio = DirPrograma;
  if (ExecutarPrograma(Argumento(downloader) + " " + identificadores, 100, false, 2, diretorio)) {
    Timer1.Enable(true);
    return;
  }
  Enable(true);
  CarregarLista(true);
  SelecionarNome(selecionado);
}

void Form1::Command2_Click() {
  if (EsperarDisquete()) Form4::Mostrar();
}
