#include "support/textos.h"

#include <array>
#include <cstddef>

#include "platform/text.h"
#include "support/mod_Traducao.h"

namespace {

constexpr auto Tabela = std::to_array<std::string_view>({
    "Carregando...",
    "Jogador 1",
    "Jogador 2",
    "Adicionar...",
    "Arquivos suportados",
    "Salvar como...",
    "Arquivo Tolvaris (*.tvk)",
    "Arquivo ZIP (*.zip)",
    "Arquivo SMC (*.smc)",
    "Copiando...",
    "Copiar do computador para o disquete",
    "Copiar do disquete para o computador",
    "Procurando...",
    "Busca concluída.",
    "Nenhum emulador foi encontrado. Clique em 'Procurar outro...'.",
    "Procurar emulador",
    "Emulador ZSnes (zsnes*.exe)",
    "Programas (*.exe)",
});
static_assert(Tabela.size() == static_cast<std::size_t>(Texto::Programas) + 1, "a text for each name");

}  // namespace

std::span<const std::string_view> TodosOsTextos() { return Tabela; }

std::string Traduzir(Texto Qual) { return Traduzir(platform::FromUtf8(Tabela[static_cast<std::size_t>(Qual)])); }
