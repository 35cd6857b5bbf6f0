// The preview picture, and small look-ups that several commands share.
#include "collection/jogo.h"
#include "mainwindow/Form1.h"
#include "platform/text.h"
#include "support/mod_Arquivos.h"

void Form1::MostrarImagem() {
  const std::string caminho = List1.Selected() == -1 ? std::string{} : ImagemDoJogo(NomeSelecionado());
  if (caminho.empty()) {
    Image1.SetPicture(Picture1);
    return;
  }
  // A damaged picture leaves the one that is shown.
  if (const platform::Picture imagem = platform::LoadPicture(LerArquivo(caminho, 1, -1))) Image1.SetPicture(imagem);
}

std::string Form1::CaminhoImagem(int Linha) const {
  if (Linha < 0 || static_cast<std::size_t>(Linha) >= Jogos.size()) return {};
  return ImagemDoJogo(Jogos[static_cast<std::size_t>(Linha)].Nome);
}

int Form1::IndiceJogo(const std::string& Nome) const {
  const std::string procurado = platform::CharUpperBuffA(Nome);
  for (std::size_t i = 0; i < Jogos.size(); ++i) {
    if (Jogos[i].Nome.size() == procurado.size() && platform::CharUpperBuffA(Jogos[i].Nome) == procurado) {
      return static_cast<int>(i);
    }
  }
  return -1;
}

std::string Form1::CaminhoCurto(const std::string& Caminho) {
  for (const std::size_t tamanho : {std::size_t{4096}, std::size_t{1023}}) {
    if (auto curto = platform::GetShortPathNameA(Caminho, tamanho); curto && !curto->empty()) return *curto;
  }
  return Caminho;
}

bool Form1::DisqueteNoDrive() { return platform::SetDriveDirectory("a:\\"); }
