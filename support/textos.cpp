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
    // For screen readers.
    "Jogos",
    "Figura do jogo",
    "Salvamentos no disquete",
    "Salvamentos no computador",
    "Jogador",
    // tvk: the help.
    "Pacotes de jogos (.tvk) para quem guarda uma coleção para outros.",
    "tvk VERBO [OPÇÕES] ARQUIVOS...",
    "faz um pacote de cada jogo",
    "mostra o que há nos pacotes",
    "confere os pacotes e não muda nada",
    "tira dos pacotes os jogos e as figuras",
    "põe os jogos dos pacotes em uma coleção",
    "muda nomes de jogos; a LISTA tem as colunas dos e nome",
    "desfaz o que um nomear mudou",
    "tvk VERBO --ajuda mostra as opções de um verbo; tvk --versao, a versão.",
    "ARQUIVOS podem ter * e ?; um diretório serve pelos pacotes que há nele.",
    "@ARQUIVO é uma lista de argumentos, um por linha; -- termina as opções.",
    "Termina com 0: tudo certo; 1: algo foi recusado; 2: uso errado.",
    "o nome do jogo; sem ela, o do arquivo",
    "o nome DOS do jogo: até 8 letras, números, \"_\" e \"-\"",
    "a figura; sem ela, a que está ao lado com o mesmo nome",
    "o diretório onde gravar; sem ela, o atual",
    "todos os jogos desta instalação do Tolvaris",
    "tabela com as colunas arquivo, nome, dos, figura",
    "como tabela CSV, para outros programas",
    "a instalação; sem ela, a que está configurada",
    "troca também os jogos diferentes que já estão lá",
    "a instalação do Tolvaris",
    "diz o que mudaria e não muda nada",
    // tvk: wrong use.
    "Veja tvk --ajuda.",
    "falta o verbo",
    "verbo desconhecido: %",
    "opção desconhecida: %",
    "opção repetida: %",
    "falta o valor da opção %",
    "faltam os arquivos",
    "--instalacao, --lista e arquivos não podem vir juntos",
    "--nome, --dos e --figura valem para um jogo só",
    "falta a opção %",
    "só pode vir um arquivo",
    // tvk: what it tells.
    "% de %, % MB/s",
    "Pacotes gravados: %; iguais aos que já estavam lá: %.",
    "Pacotes bons: %; recusados: %.",
    "Nomes mudados: %; figuras: %. Nomes que já eram esses: %.",
    "Nomes que mudariam: %; figuras: %. Nomes que já são esses: %.",
    "Guarde este arquivo para desfazer: %",
    "Desfeito. Figuras que voltaram: %.",
    "Tudo já estava como antes.",
    "DOS",
    "Figura",
    "Jogo",
    "Soma",
    "Nome",
    // tvk: why something is refused.
    "tem um caractere que a página de código do Windows não tem",
    "nenhum arquivo tem um nome assim",
    "não há pacotes neste diretório",
    "não há jogos neste diretório",
    "não existe",
    "é um diretório",
    "não é um diretório",
    "está vazio",
    "tem mais de 256 MiB",
    "não pode ser lido",
    "% não pode ser gravado",
    "% já existe com outro conteúdo",
    "não há memória para tanto",
    "não é um pacote",
    "falta uma linha no cabeçalho do pacote",
    "o cabeçalho do pacote tem um tamanho errado",
    "um nome do pacote sairia da coleção",
    "o pacote acaba antes da figura",
    "o pacote acaba antes do jogo",
    "o jogo tem um número inteiro de MiB, e por isso não tem soma",
    "a soma do jogo é outra: o pacote está cortado ou danificado",
    "o nome '%' %",
    "o nome DOS '%' %",
    "falta",
    "tem mais de 100 caracteres",
    "tem mais de 8 caracteres",
    "não pode ter o caractere %",
    "não pode começar nem acabar com espaço ou ponto",
    "é o de um dispositivo do Windows",
    "o nome '%' já é de %",
    "o nome DOS '%' já é de %",
    "o nome '%' já é de outro destes jogos",
    "o nome DOS '%' já é de outro destes jogos",
    "o Windows não deixou fazer um nome DOS",
    "não é um arquivo .zip, .smc nem .sfc",
    "não é um .zip inteiro",
    "a figura % não é uma que o Windows mostre",
    "o Windows não deixou desenhar uma figura para este jogo",
    "a figura %: %",
    "falta a coluna %",
    "falta o campo %",
    "tem mais campos que a primeira linha",
    "tem aspas sem fim, ou no meio de um campo",
    "o Tolvaris não está ao lado do tvk.exe; use --instalacao",
    "já há outro jogo com esse nome ou arquivo; --substituir o troca",
    "o jogo foi posto na coleção, mas o catálogo não pode ser gravado",
    "não pode ser gravado na coleção",
    "a coleção não tem um jogo com o nome DOS '%'",
    "já há uma figura com o nome novo: %",
    "está aberto em outro programa, ou não pode ser gravado; feche o Tolvaris",
    "não pode ser gravado; nada mudou",
    "não pode mudar; tudo está como antes",
    "não pode mudar, e o que já mudou não voltou; use tvk desfazer com %",
    "não pode mudar; só uma parte voltou: repita o comando",
    "não é um arquivo para desfazer do tvk, ou está danificado",
    "os nomes mudaram de novo depois disso; desfaça primeiro o que veio depois",
    "é outra figura agora",
    "há agora outra figura com o nome de antes",
    "a figura não está mais lá",
});
static_assert(Tabela.size() == static_cast<std::size_t>(Texto::FiguraSumiu) + 1, "a text for each name");

}  // namespace

std::span<const std::string_view> TodosOsTextos() { return Tabela; }

std::string Traduzir(Texto Qual) { return Traduzir(platform::FromUtf8(Tabela[static_cast<std::size_t>(Qual)])); }

std::string Traduzir(Texto Qual, std::initializer_list<std::string> Valores) {
  std::string texto = Traduzir(Qual);
  std::size_t posicao = 0;
  for (const std::string& valor : Valores) {
    posicao = texto.find('%', posicao);
    if (posicao == std::string::npos) break;
    texto.replace(posicao, 1, valor);
    posicao += valor.size();
  }
  return texto;
}
