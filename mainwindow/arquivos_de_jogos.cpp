#include "mainwindow/arquivos_de_jogos.h"

#include "package/cls_CRC.h"
#include "platform/files.h"
#include "platform/text.h"
#include "support/mod_Arquivos.h"

std::string TipoDoArquivo(const std::string& Caminho) {
  return platform::CharUpperBuffA(Caminho.size() > 3 ? Caminho.substr(Caminho.size() - 3) : Caminho);
}

std::optional<std::string> NomeBase(const std::string& NomeArquivo) {
  const auto Ponto = NomeArquivo.rfind('.');
  if (Ponto == std::string::npos) return std::nullopt;
  return NomeArquivo.substr(0, Ponto);
}

bool GravarInteiro(const std::string& Caminho, std::string_view Conteudo) {
  const bool Existia = ArquivoExiste(Caminho);
  if (GravarArquivo(Caminho, Conteudo, 1, true) == 1) return true;
  if (!Existia) ApagarArquivo(Caminho);
  return false;
}

std::optional<std::string> CRCDoArquivo(const std::string& Caminho) {
  platform::File Arquivo(Caminho, platform::Access::Read);
  cls_CRC Soma;
  const auto Valor = Soma.CRC(Arquivo);
  if (!Valor) return std::nullopt;
  return TextoCRC(*Valor);
}
