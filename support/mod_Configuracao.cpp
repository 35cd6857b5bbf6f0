#include "support/mod_Configuracao.h"

#include <array>

#include "platform/files.h"
#include "platform/registry.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

void DefinirDirPrograma() {
  DirPrograma = platform::ProgramDirectory();
  if (!DirPrograma.ends_with('\\')) DirPrograma += '\\';
}

void EscolherIdioma() {
  ArquivoIdioma = DirPrograma + "language.ini";
  if (!ArquivoExiste(ArquivoIdioma)) ArquivoIdioma.clear();
}

void LerCaminhos(const cls_REG& Registro) {
  struct Caminho {
    std::string& Destino;
    const char* Ajuste;
    std::string Padrao;
  };
  const std::array<Caminho, 5> caminhos = {{{DirRoms, "RomDir", DirPrograma + "Roms\\"},
                                            {DirSaves, "SaveDir", DirPrograma + "Saves\\"},
                                            {DirImgs, "ImgDir", DirPrograma + "Imgs\\"},
                                            {ArquivoEmulador, "EmuExe", ""},
                                            {ArquivoCfgEmulador, "EmuCFG", ""}}};
  for (const Caminho& cada : caminhos) {
    const Valor texto = Registro.GetValue(platform::RootCurrentUser, ChaveConfiguracao, cada.Ajuste);
    cada.Destino = CaminhoConfigurado(TextoDe(texto), cada.Padrao);
  }
}

std::string CaminhoConfigurado(const std::string& Texto, const std::string& Padrao) {
  if (Texto.empty()) return Padrao;
  return Texto.starts_with('\\') ? DirPrograma + Texto.substr(1) : Texto;
}
