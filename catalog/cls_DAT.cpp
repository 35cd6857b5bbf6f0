#include "catalog/cls_DAT.h"

#include "platform/text.h"
#include "support/mod_Arquivos.h"

namespace {

std::string CaminhoCatalogo() { return DirPrograma + "tolvaris.dat"; }

}  // namespace

void cls_DAT::AbrirLeitura(const std::string& Caminho) {
  NumArquivo = platform::File(Caminho, platform::Access::Read);
  Aberto = true;
}

void cls_DAT::AbrirLeituraGravacao(const std::string& Caminho) {
  NumArquivo = platform::File(Caminho, platform::Access::ReadWrite);
  Aberto = true;
}

void cls_DAT::Carregar() {
  if (!Aberto) AbrirLeituraGravacao(CaminhoCatalogo());
  Esquecer();
  Ler();
}

void cls_DAT::Carregar2() {
  if (!Aberto) AbrirLeitura(CaminhoCatalogo());
  Esquecer();
  Ler();
}

void cls_DAT::Atualizar() {
  if (!Aberto) return Carregar();
  Ler();
}

void cls_DAT::Fechar() {
  Aberto = false;
  Esquecer();
  NumArquivo.Close();
}

void cls_DAT::Esquecer() {
  indice_.reset();
  Dados.clear();
}

void cls_DAT::Ler() {
  auto lido = LerInteiro(NumArquivo);
  if (!lido || lido->empty()) return;
  indice_.reset();
  Dados = std::move(*lido);
}

const Indice& cls_DAT::IndiceDosDados() const {
  if (!indice_) indice_.emplace(Dados);
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

void cls_DAT::RegistrarRom(const std::string& Nome, const std::string& DOSName) {
  const std::string entrada = "|" + platform::CharUpperBuffA(DOSName) + "=" + Nome + "|";
  if (Dados.find(entrada) != std::string::npos) return;
  const std::int64_t fim = NumArquivo.Size();
  if (fim < 0) return;
  if (NumArquivo.Write(fim, entrada)) {
    NumArquivo.Flush();
  } else {
    NumArquivo.SetSize(fim);  // half an entry would change the lookups of the ones that follow it
  }
}

cls_DAT& Catalogo() {
  static cls_DAT catalogo;
  return catalogo;
}
