#include "catalog/reescrita.h"

#include <algorithm>
#include <cstddef>
#include <set>

#include "catalog/cls_DAT.h"
#include "support/caracteres.h"
#include "support/gravacao.h"
#include "support/mod_Arquivos.h"

namespace {

using platform::Existing;

// What lies between the bars: an entry, what stands before the first bar, or nothing.
std::vector<std::string_view> PartesDe(std::string_view Dados) {
  std::vector<std::string_view> partes;
  for (std::size_t barra = AcharCaractere(Dados, '|'); barra != std::string_view::npos;
       barra = AcharCaractere(Dados, '|')) {
    partes.push_back(Dados.substr(0, barra));
    Dados.remove_prefix(barra + 1);
  }
  partes.push_back(Dados);
  return partes;
}

std::string_view ChaveDe(std::string_view Parte) { return Parte.substr(0, Parte.find('=')); }

// An entry that goes takes one of its bars along, where they are its own.
std::string SemEntradas(const std::vector<std::string_view>& Partes, const std::set<std::string_view>& Chaves) {
  std::string texto;
  for (std::size_t i = 1; i < Partes.size(); ++i) {
    const bool entrada = Partes[i].find('=') != std::string_view::npos;
    if (!entrada || !Chaves.contains(ChaveDe(Partes[i]))) {
      texto.append("|").append(Partes[i]);
    } else if (Partes[i - 1].empty() && i + 1 < Partes.size() && Partes[i + 1].empty()) {
      ++i;
    }
  }
  return texto;
}

bool Gravar(ArquivoAoLado& Novo, std::string_view Texto) {
  return Novo.Arquivo().Write(0, Texto) && Novo.Arquivo().Flush();
}

bool AindaEsta(const TextoDoCatalogo& Antes) {
  TextoDoCatalogo agora;
  return LerSozinho(agora) && agora == Antes;
}

}  // namespace

// The new entries come first: the earliest one answers. What stands before the first bar is no entry, and stays none.
std::string ComNomes(std::string_view Dados, const std::vector<NomeNovo>& Novos) {
  const std::vector<std::string_view> partes = PartesDe(Dados);
  std::string texto(partes[0]);
  std::set<std::string_view> chaves;
  for (const NomeNovo& novo : Novos) {
    texto += "|" + novo.DOSName + "=" + novo.Nome + "|";
    chaves.insert(novo.DOSName);
  }
  return texto + SemEntradas(partes, chaves);
}

bool LerSozinho(TextoDoCatalogo& Texto) {
  Texto.reset();
  if (!platform::FileSize(CaminhoCatalogo())) return true;
  platform::File arquivo(CaminhoCatalogo(), platform::Access::Alone);
  const std::int64_t tamanho = arquivo.Size();
  Texto = LerInteiro(arquivo);
  return Texto && std::ssize(*Texto) == tamanho;
}

// The look at the file comes last: what another program appends until then is not lost.
bool TrocarCatalogo(const TextoDoCatalogo& Antes, const TextoDoCatalogo& Depois) {
  if (!Depois) return AindaEsta(Antes) && platform::DeleteFileA(CaminhoCatalogo());
  ArquivoAoLado novo(CaminhoCatalogo());
  if (!Gravar(novo, *Depois) || !AindaEsta(Antes)) return false;
  return novo.TomarNome(Antes ? Existing::Replace : Existing::Keep);
}
