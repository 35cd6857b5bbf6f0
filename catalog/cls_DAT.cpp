#include "catalog/cls_DAT.h"

#include "platform/text.h"
#include "support/mod_Arquivos.h"

std::string CaminhoCatalogo() { return DirPrograma + "tolvaris.dat"; }

void cls_DAT::AbrirLeitura(const std::string& Caminho) {
  numArquivo_ = platform::File(Caminho, platform::Access::Read);
  aberto_ = true;
}

void cls_DAT::AbrirLeituraGravacao(const std::string& Caminho) {
  numArquivo_ = platform::File(Caminho, platform::Access::ReadWrite);
  aberto_ = true;
}

void cls_DAT::Carregar() {
  if (!aberto_) AbrirLeituraGravacao(CaminhoCatalogo());
  Esquecer();
  Ler();
}

void cls_DAT::Carregar2() {
  if (!aberto_) AbrirLeitura(CaminhoCatalogo());
  Esquecer();
  Ler();
}

void cls_DAT::Atualizar() {
  if (!aberto_) return Carregar();
  Ler();
}

void cls_DAT::Fechar() {
  aberto_ = false;
  Esquecer();
  numArquivo_.Close();
}

void cls_DAT::Esquecer() {
  indice_.reset();
  dados_.clear();
}

void cls_DAT::Ler() {
  auto lido = LerInteiro(numArquivo_);
  if (!lido || lido->empty()) return;
  indice_.reset();
  dados_ = std::move(*lido);
}

const Indice& cls_DAT::IndiceDosDados() const {
  if (!indice_) indice_.emplace(dados_);
  return *indice_;
}

std::string cls_DAT::DefineNome(const std::string& DOSName, Booleano& Encontrado) const {
  const auto nome = IndiceDosDados().Nome(platform::CharUpperBuffA(DOSName));
  Encontrado = nome ? Verdadeiro : Falso;
  return nome ? std::string(*nome) : DOSName;
}

std::string cls_DAT::DefineDOSName(const std::string& Nome) const {
  const auto chave = IndiceDosDados().Chave(Nome);
  return chave ? std::string(*chave) : Nome;
}

bool cls_DAT::RegistrarRom(const std::string& Nome, const std::string& DOSName) {
  const std::string entrada = "|" + platform::CharUpperBuffA(DOSName) + "=" + Nome + "|";
  if (dados_.find(entrada) != std::string::npos) return true;
  const std::int64_t fim = numArquivo_.Size();
  if (fim < 0) return false;
  if (numArquivo_.Write(fim, entrada)) return numArquivo_.Flush();
  numArquivo_.SetSize(fim);  // half an entry would change the lookups of the ones that follow it
  return false;
}

cls_DAT& Catalogo() {
  static cls_DAT catalogo;
  return catalogo;
}
