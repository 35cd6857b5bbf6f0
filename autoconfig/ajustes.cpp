#include "autoconfig/ajustes.h"

#include <algorithm>

#include "platform/files.h"
#include "platform/registry.h"
#include "platform/text.h"
#include "support/caminhos.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

namespace {

constexpr std::size_t MaiorAjuste = 254;     // what is longer cannot be read back
constexpr std::size_t MaiorCaminho = 32768;  // of any path, its closing NUL included

// The path behind the directory, with a leading backslash; the whole path when it lies elsewhere.
std::string RelativoA(const std::string& Diretorio, const std::string& Caminho) {
  const std::string inicio = Caminho.substr(0, Diretorio.size());
  if (platform::CharUpperBuffA(inicio) != platform::CharUpperBuffA(Diretorio)) return Caminho;
  return Caminho.substr(Diretorio.size() - 1);
}

std::string LerTexto(const cls_REG& Registro, const char* Nome) {
  return TextoDe(Registro.GetValue(platform::RootCurrentUser, ChaveConfiguracao, Nome));
}

}  // namespace

bool GravarAjustes(const cls_REG& Registro, const Ajustes& Novos) {
  return std::all_of(AjustesDeCaminhos.begin(), AjustesDeCaminhos.end(), [&](const AjusteDeCaminho& Cada) {
    const std::string& novo = Novos.*Cada.Texto;
    if (LerTexto(Registro, Cada.Nome) == novo) return true;
    Registro.SetValue(platform::RootCurrentUser, ChaveConfiguracao, Cada.Nome, novo);
    return LerTexto(Registro, Cada.Nome) == novo;
  });
}

Ajustes AjustesPara(const std::string& Emulador, const Ajustes& Atuais, bool Outro) {
  Ajustes novos = Atuais;
  for (const AjusteDeCaminho& cada : AjustesDeCaminhos) {
    if ((novos.*cada.Texto).empty()) novos.*cada.Texto = cada.Padrao;
  }
  for (std::string Ajustes::*diretorio : {&Ajustes::RomDir, &Ajustes::SaveDir, &Ajustes::ImgDir}) {
    novos.*diretorio = ComBarra(novos.*diretorio);
  }
  if (Emulador.empty()) return novos;
  if (Outro || novos.EmuExe.empty()) novos.EmuExe = AjusteDoEmulador(Emulador);
  if (Outro || novos.EmuCFG.empty()) novos.EmuCFG = CaminhoRelativo(ConfiguracaoDoEmulador(Emulador));
  return novos;
}

std::string CaminhoRelativo(const std::string& Caminho) { return RelativoA(DirPrograma, Caminho); }

// Written relative to the program's directory it would still have the blanks of that directory.
std::string AjusteDoEmulador(const std::string& Emulador) {
  if (!TemBranco(Emulador)) return CaminhoRelativo(Emulador);
  const auto curto = platform::GetShortPathNameA(Emulador, MaiorCaminho);
  if (!curto || TemBranco(*curto)) return CaminhoRelativo(Emulador);
  if (TemBranco(DirPrograma)) return *curto;
  return RelativoA(platform::GetShortPathNameA(DirPrograma, MaiorCaminho).value_or(DirPrograma), *curto);
}

bool TemBranco(const std::string& Caminho) { return Caminho.find(' ') != std::string::npos; }

std::string ConfiguracaoDoEmulador(const std::string& Emulador) {
  const std::string diretorio = DiretorioDe(Emulador);
  std::string paraWindows = diretorio + "zsnesw.cfg", paraDos = diretorio + "zsnes.cfg";
  const std::string executavel = platform::CharUpperBuffA(UltimaParte(Emulador));
  if (executavel.starts_with("ZSNESW")) return paraWindows;
  if (executavel.starts_with("ZSNES")) return paraDos;
  return ArquivoExiste(paraDos) && !ArquivoExiste(paraWindows) ? paraDos : paraWindows;
}

std::optional<Mensagem> Impedimento(const std::string& Texto) {
  if (Texto.size() > MaiorAjuste) return Mensagem::CaminhoLongo;
  if (Texto.starts_with("\\\\")) return Mensagem::CaminhoEmRede;
  return std::nullopt;
}
