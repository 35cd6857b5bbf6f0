#include "support/cls_REG.h"

#include <array>
#include <charconv>
#include <cstring>
#include <limits>
#include <string_view>

#include "support/brancos.h"

namespace {

using platform::RegistryKey;

// Where a key path lies.
struct Raiz {
  std::uint32_t Chave;
  const std::string& Computador;  // empty: this one
};

std::string SemBarra(const std::string& Caminho) { return Caminho.starts_with('\\') ? Caminho.substr(1) : Caminho; }

// An open key, closed at the end of its life.
class ChaveAberta {
 public:
  ChaveAberta(const Raiz& Onde, const std::string& Caminho) {
    RegistryKey base = platform::RootKey(Onde.Chave);
    RegistryKey remota = 0;
    if (!Onde.Computador.empty()) {
      platform::RegConnectRegistryA(Onde.Computador, base, remota);
      base = remota;
    }
    if (platform::RegOpenKeyExA(base, Caminho, platform::KeyQueryAndSet, chave_) != 0) chave_ = 0;
    if (remota != 0) platform::RegCloseKey(remota);
  }
  ~ChaveAberta() {
    if (chave_ != 0) platform::RegCloseKey(chave_);
  }
  ChaveAberta(const ChaveAberta&) = delete;
  ChaveAberta& operator=(const ChaveAberta&) = delete;
  ChaveAberta(ChaveAberta&&) = delete;
  ChaveAberta& operator=(ChaveAberta&&) = delete;

  explicit operator bool() const { return chave_ != 0; }
  RegistryKey Numero() const { return chave_; }

 private:
  RegistryKey chave_ = 0;
};

struct Lido {
  std::uint32_t Tipo = 0;
  std::uint32_t Tamanho = 0;
  std::array<char, 255> Bytes{};
};

std::optional<Lido> Consultar(const ChaveAberta& Chave, const std::string& Nome) {
  Lido lido;
  lido.Tamanho = static_cast<std::uint32_t>(lido.Bytes.size());
  if (platform::RegQueryValueExA(Chave.Numero(), Nome, lido.Tipo, lido.Bytes.data(), lido.Tamanho) != 0) {
    return std::nullopt;
  }
  return lido;
}

// The first four bytes as a number; nothing when there are more.
std::optional<std::int32_t> NumeroDe(const Lido& Dado) {
  if (Dado.Tamanho > sizeof(std::int32_t)) return std::nullopt;
  std::int32_t numero;
  std::memcpy(&numero, Dado.Bytes.data(), sizeof numero);
  return numero;
}

Valor ValorDe(const Lido& Dado) {
  constexpr std::int16_t ilegivel = 0;
  const auto numero = NumeroDe(Dado);
  switch (Dado.Tipo) {
    case platform::RegistryText:
      if (Dado.Tamanho == 0) return {};
      return std::string(Dado.Bytes.data(), Dado.Tamanho - 1);
    case platform::RegistryNumber:
      return numero ? Valor(*numero) : Valor(ilegivel);
    case platform::RegistryBinary:
      return numero ? Valor(static_cast<std::uint8_t>(*numero)) : Valor(ilegivel);
    default:
      return {};
  }
}

void GravarTexto(const ChaveAberta& Chave, const std::string& Nome, const std::string& Texto) {
  platform::RegSetValueExA(Chave.Numero(), Nome, platform::RegistryText, Texto.c_str(),
                           static_cast<std::uint32_t>(Texto.size() + 1));
}

void GravarNumero(const ChaveAberta& Chave, const std::string& Nome, const Valor& Novo) {
  if (const auto numero = InteiroDe(Novo)) {
    platform::RegSetValueExA(Chave.Numero(), Nome, platform::RegistryNumber, &*numero, sizeof *numero);
  }
}

void GravarByte(const ChaveAberta& Chave, const std::string& Nome, const Valor& Novo) {
  const auto numero = InteiroDe(Novo);
  if (!numero || *numero < 0 || *numero > std::numeric_limits<std::uint8_t>::max()) return;
  const auto byte = static_cast<std::uint8_t>(*numero);
  platform::RegSetValueExA(Chave.Numero(), Nome, platform::RegistryBinary, &byte, sizeof byte);
}

bool ChaveExiste(const Raiz& Onde, const std::string& Caminho) {
  return static_cast<bool>(ChaveAberta(Onde, SemBarra(Caminho)));
}

void CriarChave(const Raiz& Onde, const std::string& Caminho) {
  const ChaveAberta base(Onde, "");
  RegistryKey criada = 0;
  if (base && platform::RegCreateKeyA(base.Numero(), Caminho, criada) == 0) platform::RegCloseKey(criada);
}

void CriarCaminhoChave(const Raiz& Onde, const std::string& Caminho) {
  for (auto barra = Caminho.find('\\'); barra != std::string::npos; barra = Caminho.find('\\', barra + 1)) {
    const std::string trecho = Caminho.substr(0, barra + 1);
    if (!ChaveExiste(Onde, trecho)) CriarChave(Onde, trecho);
  }
  if (!ChaveExiste(Onde, Caminho)) CriarChave(Onde, Caminho);
}

}  // namespace

std::string TextoDe(const Valor& Value) {
  if (const auto* texto = std::get_if<std::string>(&Value)) return *texto;
  const auto numero = InteiroDe(Value);
  return numero ? std::to_string(*numero) : "";
}

std::optional<std::int32_t> InteiroDe(const Valor& Value) {
  if (const auto* byte = std::get_if<std::uint8_t>(&Value)) return *byte;
  if (const auto* curto = std::get_if<std::int16_t>(&Value)) return *curto;
  if (const auto* longo = std::get_if<std::int32_t>(&Value)) return *longo;
  const auto* texto = std::get_if<std::string>(&Value);
  if (texto == nullptr) return std::nullopt;
  std::string_view digitos = SemBrancos(*texto, " \t");
  if (digitos.starts_with('+') && !digitos.starts_with("+-")) digitos.remove_prefix(1);
  std::int32_t numero = 0;
  const auto [fim, erro] = std::from_chars(digitos.data(), digitos.data() + digitos.size(), numero);
  if (erro != std::errc() || fim != digitos.data() + digitos.size()) return std::nullopt;
  return numero;
}

bool cls_REG::SetValue(std::uint32_t Predefinedkey, const std::string& Keyname, const std::string& ValueName,
                       const Valor& Value, const std::string& ComputerName) const {
  const Raiz raiz{Predefinedkey, ComputerName};
  const std::string caminho = SemBarra(Keyname);
  CriarCaminhoChave(raiz, caminho);
  const ChaveAberta chave(raiz, caminho);
  if (!chave) return true;
  const auto atual = Consultar(chave, ValueName);
  if (!atual || atual->Tipo == platform::RegistryText) {
    GravarTexto(chave, ValueName, TextoDe(Value));
  } else if (atual->Tipo == platform::RegistryNumber) {
    GravarNumero(chave, ValueName, Value);
  } else if (atual->Tipo == platform::RegistryBinary) {
    GravarByte(chave, ValueName, Value);
  }
  return true;
}

Valor cls_REG::GetValue(std::uint32_t Predefinedkey, const std::string& Keyname, const std::string& ValueName,
                        const std::string& ComputerName) const {
  const ChaveAberta chave({Predefinedkey, ComputerName}, SemBarra(Keyname));
  if (!chave) return {};
  const auto lido = Consultar(chave, ValueName);
  return lido ? ValorDe(*lido) : Valor();
}

bool cls_REG::DeletKey(std::uint32_t Predefinedkey, const std::string& Keyname, const std::string& ComputerName) const {
  const Raiz raiz{Predefinedkey, ComputerName};
  if (Keyname.empty() || !ChaveExiste(raiz, Keyname)) return false;
  const ChaveAberta base(raiz, "");
  if (!base) return false;
  platform::RegDeleteKeyA(base.Numero(), Keyname);
  return true;
}
