#include "autoconfig/ajustes.h"

#include <algorithm>

#include "platform/files.h"
#include "platform/registry.h"
#include "platform/text.h"
#include "support/caminhos.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Configuracao.h"
#include "support/mod_Globais.h"

namespace {

constexpr std::size_t MaiorAjuste = 254;     // what is longer cannot be read back
constexpr std::size_t MaiorCaminho = 32768;  // of any path, its closing NUL included

// The path behind the directory, with a leading backslash; the whole path when it lies elsewhere.
std::string RelativoA(const std::string& Diretorio, const std::string& Caminho) {
  const std::string Inicio = Caminho.substr(0, Diretorio.size());
  if (platform::CharUpperBuffA(Inicio) != platform::CharUpperBuffA(Diretorio)) return Caminho;
  return Caminho.substr(Diretorio.size() - 1);
}

std::string LerTexto(const cls_REG& Registro, const char* Nome) {
  return TextoDe(Registro.GetValue(platform::RootCurrentUser, ChaveConfiguracao, Nome));
}

}  // namespace

Ajustes LerAjustes(const cls_REG& Registro) {
  Ajustes Lidos;
  for (const NomeDeAjuste& Cada : NomesDosAjustes) Lidos.*Cada.Texto = LerTexto(Registro, Cada.Nome);
  return Lidos;
}

bool GravarAjustes(const cls_REG& Registro, const Ajustes& Novos) {
  return std::all_of(NomesDosAjustes.begin(), NomesDosAjustes.end(), [&](const NomeDeAjuste& Cada) {
    const std::string& Novo = Novos.*Cada.Texto;
    if (LerTexto(Registro, Cada.Nome) == Novo) return true;
    Registro.SetValue(platform::RootCurrentUser, ChaveConfiguracao, Cada.Nome, Novo);
    return LerTexto(Registro, Cada.Nome) == Novo;
  });
}

Ajustes AjustesPara(const std::string& Emulador, const Ajustes& Atuais, bool Outro) {
  Ajustes Novos = Atuais;
  const auto Preencher = [](std::string& Ajuste, bool Mudar, const std::string& Texto) {
    if (Mudar || Ajuste.empty()) Ajuste = Texto;
  };
  Preencher(Novos.RomDir, false, CaminhoRelativo(DirPrograma + "Roms\\"));
  Preencher(Novos.SaveDir, false, CaminhoRelativo(DirPrograma + "Saves\\"));
  Preencher(Novos.ImgDir, false, CaminhoRelativo(DirPrograma + "Imgs\\"));
  if (Emulador.empty()) return Novos;
  Preencher(Novos.EmuExe, Outro, AjusteDoEmulador(Emulador));
  Preencher(Novos.EmuCFG, Outro, CaminhoRelativo(ConfiguracaoDoEmulador(Emulador)));
  return Novos;
}

std::string CaminhoRelativo(const std::string& Caminho) { return RelativoA(DirPrograma, Caminho); }

// Written relative to the program's directory it would still have the blanks of that directory.
std::string AjusteDoEmulador(const std::string& Emulador) {
  if (!TemBranco(Emulador)) return CaminhoRelativo(Emulador);
  const auto Curto = platform::GetShortPathNameA(Emulador, MaiorCaminho);
  if (!Curto || TemBranco(*Curto)) return CaminhoRelativo(Emulador);
  if (TemBranco(DirPrograma)) return *Curto;
  return RelativoA(platform::GetShortPathNameA(DirPrograma, MaiorCaminho).value_or(DirPrograma), *Curto);
}

bool TemBranco(const std::string& Caminho) { return Caminho.find(' ') != std::string::npos; }

std::string ConfiguracaoDoEmulador(const std::string& Emulador) {
  const std::string Diretorio = DiretorioDe(Emulador);
  std::string ParaWindows = Diretorio + "zsnesw.cfg", ParaDos = Diretorio + "zsnes.cfg";
  const std::string Executavel = platform::CharUpperBuffA(UltimaParte(Emulador));
  if (Executavel.starts_with("ZSNESW")) return ParaWindows;
  if (Executavel.starts_with("ZSNES")) return ParaDos;
  return ArquivoExiste(ParaDos) && !ArquivoExiste(ParaWindows) ? ParaDos : ParaWindows;
}

std::optional<Mensagem> Impedimento(const std::string& Texto) {
  if (Texto.size() > MaiorAjuste) return Mensagem::CaminhoLongo;
  if (Texto.starts_with("\\\\")) return Mensagem::CaminhoEmRede;
  return std::nullopt;
}
