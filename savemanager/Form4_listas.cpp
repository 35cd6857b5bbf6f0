// The two panes: filling them and picking an entry.
#include "catalog/cls_DAT.h"
#include "platform/files.h"
#include "savemanager/Form4.h"
#include "savemanager/nomes.h"
#include "support/mod_Traducao.h"

void Form4::ListarDisquete() { Listar(Disquete); }

void Form4::ListarComputador() { Listar(Computador); }

void Form4::Listar(const Painel& painel) {
  painel.Lista.Enable(false);
  Direcao = Origem::Nenhuma;
  painel.Lixeira.Show(false);
  Command1.Show(false);
  Preencher(painel);
  painel.Lista.Enable(true);
}

void Form4::Preencher(const Painel& painel) {
  std::vector<std::string> textos;
  if (!painel.Diretorio.empty()) {
    for (const platform::DirectoryEntry& arquivo : platform::ListDirectory(painel.Diretorio, PadraoSalvamentos)) {
      textos.push_back(NomeExibido(arquivo.Name, Catalogo()));
    }
  }
  painel.Lista.Fill(textos);
}

void Form4::List1_Click() { Escolher(Disquete); }

void Form4::List2_Click() { Escolher(Computador); }

void Form4::Escolher(const Painel& painel) {
  if (painel.Lista.Selected() < 0) return;
  Outro(painel).Lista.Select(-1);
  Outro(painel).Lixeira.Show(false);
  painel.Lixeira.Show(true);
  if (Direcao != painel.Lado) {
    Command1.SetIcon(painel.Seta);
    Command1.SetToolTip(Traduzir(painel.Copiar));
    Command1.Show(true);
    Direcao = painel.Lado;
  }
  ArquivoAtual = NomeArquivo(painel.Lista.Text(painel.Lista.Selected()), Catalogo());
}
