#include "collection/jogo.h"

#include "catalog/cls_DAT.h"
#include "support/caminhos.h"
#include "support/mod_Globais.h"

Jogo LerJogo(const platform::DirectoryEntry& Entrada, const std::string& DirCurto) {
  Jogo jogo;
  const auto base = NomeBase(Entrada.Name);
  if (!base) return jogo;
  Booleano encontrado = Falso;
  jogo.Nome = Catalogo().DefineNome(*base, encontrado);
  jogo.Catalogado = encontrado != Falso;
  if (jogo.Catalogado) jogo.DOSName = Catalogo().DefineDOSName(jogo.Nome);
  jogo.ArquivoCurto = DirCurto + (Entrada.ShortName.empty() ? Entrada.Name : Entrada.ShortName);
  jogo.SemCaminho = Entrada.PathName().empty();
  jogo.Arquivo = DirRoms + (jogo.SemCaminho ? Entrada.Name : Entrada.PathName());
  return jogo;
}

std::string ImagemDoJogo(const std::string& Nome) { return ImagemEm(DirImgs, Nome); }

std::string ImagemEm(const std::string& Diretorio, const std::string& Nome) {
  for (const char* extensao : ExtensoesDeImagem) {
    std::string caminho = Diretorio + Nome + extensao;
    if (platform::FileSize(caminho).value_or(0) != 0) return caminho;
  }
  return "";
}
