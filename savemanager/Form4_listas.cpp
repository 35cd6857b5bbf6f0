// The two panes: filling them and picking an entry.
#include "catalog/cls_DAT.h"
#include "platform/files.h"
#include "savemanager/Form4.h"
#include "savemanager/nomes.h"
#include "support/mod_Traducao.h"

void Form4::ListarDisquete() { Listar(disquete_); }

void Form4::ListarComputador() { Listar(computador_); }

void Form4::Listar(const Painel& Este) {
  Este.Lista.Enable(false);
  Direcao = Origem::Nenhuma;
  Este.Lixeira.Show(false);
  Command1.Show(false);
  Preencher(Este);
  Este.Lista.Enable(true);
}

void Form4::Preencher(const Painel& Este) {
  std::vector<std::string> textos;
  if (!Este.Diretorio.empty()) {
    for (const platform::DirectoryEntry& arquivo : platform::ListDirectory(Este.Diretorio, PadraoSalvamentos)) {
      if (!arquivo.PathName().empty()) textos.push_back(NomeExibido(arquivo.PathName(), Catalogo()));
    }
  }
  Este.Lista.Fill(textos);
}

void Form4::List1_Click() { Escolher(disquete_); }

void Form4::List2_Click() { Escolher(computador_); }

void Form4::Escolher(const Painel& Este) {
  if (Este.Lista.Selected() < 0) return;
  Outro(Este).Lista.Select(-1);
  Outro(Este).Lixeira.Show(false);
  Este.Lixeira.Show(true);
  if (Direcao != Este.Lado) {
    Command1.SetIcon(Este.Seta);
    Command1.SetToolTip(Traduzir(Este.Copiar));
    Command1.Show(true);
    Direcao = Este.Lado;
  }
  ArquivoAtual = NomeArquivo(Este.Lista.Text(Este.Lista.Selected()), Catalogo());
}
