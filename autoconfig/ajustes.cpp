#include "autoconfig/ajustes.h"

#include <algorithm>

#include "platform/registry.h"
#include "platform/text.h"
#include "support/caminhos.h"
#include "support/mod_Arquivos.h"
#include "support/mod_Globais.h"

namespace {

constexpr std::size_t MaiorAjuste = 254;  // what is longer cannot be read back

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
    std::string& novo = novos.*cada.Texto;
    if (novo.empty()) novo = cada.Padrao;
    if (cada.EhDiretorio) novo = ComBarra(novo);
  }
  if (Emulador.empty()) return novos;
  if (Outro || novos.EmuExe.empty()) novos.EmuExe = CaminhoRelativo(Emulador);
  if (Outro || novos.EmuCFG.empty()) novos.EmuCFG = CaminhoRelativo(ConfiguracaoDoEmulador(Emulador));
  return novos;
}

std::string CaminhoRelativo(const std::string& Caminho) {
  const std::string inicio = Caminho.substr(0, DirPrograma.size());
  if (platform::CharUpperBuffA(inicio) != platform::CharUpperBuffA(DirPrograma)) return Caminho;
  return Caminho.substr(DirPrograma.size() - 1);
}

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
