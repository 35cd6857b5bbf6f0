#include "support/mod_Configuracao.h"

#include "platform/files.h"
#include "platform/registry.h"
#include "support/caracteres.h"
#include "support/mod_Arquivos.h"

void DefinirDirPrograma() {
  DirPrograma = platform::ProgramDirectory();
  if (!TerminaCom(DirPrograma, '\\')) DirPrograma += '\\';
}

void EscolherIdioma() {
  ArquivoIdioma = DirPrograma + "language.ini";
  if (!ArquivoExiste(ArquivoIdioma)) ArquivoIdioma.clear();
}

Ajustes LerAjustes(const cls_REG& Registro) {
  Ajustes lidos;
  for (const AjusteDeCaminho& cada : AjustesDeCaminhos) {
    lidos.*cada.Texto = TextoDe(Registro.GetValue(platform::RootCurrentUser, ChaveConfiguracao, cada.Nome));
  }
  return lidos;
}

void LerCaminhos(const cls_REG& Registro) {
  const Ajustes lidos = LerAjustes(Registro);
  for (const AjusteDeCaminho& cada : AjustesDeCaminhos) {
    const std::string& texto = lidos.*cada.Texto;
    *cada.Destino = CaminhoConfigurado(texto.empty() ? cada.Padrao : texto);
  }
}

std::string CaminhoConfigurado(const std::string& Texto) {
  return Texto.starts_with('\\') ? DirPrograma + Texto.substr(1) : Texto;
}
