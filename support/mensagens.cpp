#include "support/mensagens.h"

#include <algorithm>
#include <iterator>

#include "platform/text.h"
#include "support/mod_Traducao.h"

namespace {

using enum Mensagem;
using enum platform::Buttons;
using enum platform::Icon;

constexpr DescricaoDeMensagem TabelaDeMensagens[] = {
    {SemConfiguracao,
     "SemConfiguracao",
     {"O Tolvaris não foi configurado.", Peca::Linha, "Clique em 'Sim' para rodar o programa de auto-configuração."},
     "Configuração",
     YesNoCancel,
     Information},
    {SemConfigurador,
     "SemConfigurador",
     {"Não foi possível configurar o Tolvaris, o programa de auto-configuração não foi encontrado.", Peca::Linha,
      "Reinstale o programa."},
     "Erro",
     Ok,
     Critical},
    {GuardeOsComandos,
     "GuardeOsComandos",
     {"Guarde os comandos do controle. Se necessário anote-os."},
     "Informação",
     Ok,
     Information},

    {JogoDesconhecido, "JogoDesconhecido", {"Erro interno: jogo não encontrado no sistema."}, "Erro", Ok, Critical},
    {JogoNaoEncontrado, "JogoNaoEncontrado", {"O jogo não foi encontrado."}, "Erro", Ok, Critical},
    {NomeForaDoWindows,
     "NomeForaDoWindows",
     {"O nome do arquivo do jogo tem letras que o Tolvaris não pode usar neste Windows.", Peca::Linha,
      "Mude o nome do arquivo e abra o Tolvaris de novo."},
     "Erro",
     Ok,
     Critical},
    {EmuladorNaoEncontrado, "EmuladorNaoEncontrado", {"O emulador ZSnes não foi encontrado."}, "Erro", Ok, Critical},
    {SemDisquete,
     "SemDisquete",
     {"Não há disquete na unidade A:\\", Peca::Paragrafo, "Coloque um disquete e clique em 'Repetir'."},
     "Disquete A:",
     RetryCancel,
     Exclamation},
    {ComoFecharOJogo,
     "ComoFecharOJogo",
     {"Para fechar o jogo precione e segure a tecla 'ALT' e simultaneamente aperte e tecla 'F4'"},
     "Informação",
     Ok,
     Information},

    {JogoAdicionado, "JogoAdicionado", {"Jogo adicionado com sucesso."}, "Ok", Ok, Information},
    {JogoJaExiste,
     "JogoJaExiste",
     {"O jogo a ser adiciona já existe.", Peca::Paragrafo, "Substituir ?"},
     "Confirmar",
     YesNoCancel,
     Exclamation},
    {JogoCorrompido,
     "JogoCorrompido",
     {"Houve uma diferença na medição dos códigos CRC.", Peca::Linha,
      "Essa mudança indica que o arquivo está corrompido."},
     "Erro",
     Ok,
     Critical},
    {ErroAoLer, "ErroAoLer", {"Erro ao ler arquivo."}, "Erro", Ok, Critical},
    {ErroAoGravar, "ErroAoGravar", {"Erro ao gravar arquivo."}, "Erro", Ok, Critical},
    {ErroAoSalvar, "ErroAoSalvar", {"Erro ao salvar arquivo."}, "Erro", Ok, Critical},
    {ArquivoJaExiste,
     "ArquivoJaExiste",
     {"Arquivo já existente.", Peca::Paragrafo, "Substituir ?"},
     "Confirmar",
     YesNoCancel,
     Exclamation},
    {ArquivoSalvo, "ArquivoSalvo", {"Arquivo salvo."}, "Ok", Ok, Information},
    {DeletarJogo,
     "DeletarJogo",
     {"Deletar o jogo '", Peca::Branco, Peca::Valor, Peca::Branco, "' ?"},
     "Confirmar deleção",
     YesNoCancel,
     Exclamation},
    {SemDownloader, "SemDownloader", {"O programa de download não foi encontrado."}, "Erro", Ok, Critical},

    {DiscoCheio,
     "DiscoCheio",
     {"Não há espaço livre suficiente em disco para completar a operação."},
     "Disco cheio",
     Ok,
     Exclamation},
    {SalvamentoNoDisquete,
     "SalvamentoNoDisquete",
     {"O salvamento selecionado já se encontra no Disquete (A:).", Peca::Linha, "Você deseja substituí-lo ?"},
     "Salvamento já existente",
     YesNoCancel,
     Question},
    {SalvamentoNoComputador,
     "SalvamentoNoComputador",
     {"O salvamento selecionado já se encontra no Computador.", Peca::Linha, "Você deseja substituí-lo ?"},
     "Salvamento já existente",
     YesNoCancel,
     Question},
    {DeletarDoDisquete,
     "DeletarDoDisquete",
     {"Deletar o salvamento do jogo '", Peca::Valor, "' que está no Disquete (A:) ?"},
     "Confirmar deleção",
     YesNoCancel,
     Question},
    {DeletarDoComputador,
     "DeletarDoComputador",
     {"Deletar o salvamento do jogo '", Peca::Valor, "' que está no Computador ?"},
     "Confirmar deleção",
     YesNoCancel,
     Question},

    {CaminhoLongo,
     "CaminhoLongo",
     {"O caminho é longo demais: o Tolvaris lê no máximo 254 caracteres.", Peca::Paragrafo, Peca::Valor},
     "Erro",
     Ok,
     Critical},
    {CaminhoEmRede,
     "CaminhoEmRede",
     {"O caminho está em uma rede: dê uma letra de unidade a ele.", Peca::Paragrafo, Peca::Valor},
     "Erro",
     Ok,
     Critical},
    {EmuladorDoDos,
     "EmuladorDoDos",
     {"Este emulador é um programa do DOS, que o Windows de 64 bits não inicia.", Peca::Linha,
      "Escolha o emulador feito para o Windows (zsnesw.exe).", Peca::Paragrafo, Peca::Valor},
     "Erro",
     Ok,
     Critical},
    {ConfiguracaoMaisNova,
     "ConfiguracaoMaisNova",
     {"Este emulador guarda a configuração em uma forma mais nova, que o Tolvaris não altera ao jogar.", Peca::Linha,
      "Com ele a opção de usar disquete não tem efeito.", Peca::Paragrafo,
      "Gravar agora nessa configuração os diretórios de jogos e de salvamentos do Tolvaris ?"},
     "Confirmar",
     YesNoCancel,
     Question},
    {ConfiguracaoProtegida,
     "ConfiguracaoProtegida",
     {"O Windows não deixa o Tolvaris gravar a configuração deste emulador: ele não usará os diretórios do Tolvaris "
      "nem o "
      "disquete.",
      Peca::Linha, "Ponha o emulador em um diretório seu, como C:\\ZSNES, e escolha-o de novo.", Peca::Paragrafo,
      Peca::Valor},
     "Informação",
     Ok,
     Exclamation},
    {ErroAoGravarConfiguracao,
     "ErroAoGravarConfiguracao",
     {"Erro ao gravar arquivo.", Peca::Paragrafo, Peca::Valor},
     "Erro",
     Ok,
     Critical},
    {ErroAoGravarAjustes, "ErroAoGravarAjustes", {"Não foi possível gravar a configuração."}, "Erro", Ok, Critical},
};

const DescricaoDeMensagem& Descricao(Mensagem Qual) { return TabelaDeMensagens[static_cast<std::size_t>(Qual)]; }

constexpr bool EstaEmOrdem() {
  for (std::size_t i = 0; i < std::size(TabelaDeMensagens); ++i) {
    if (TabelaDeMensagens[i].Qual != static_cast<Mensagem>(i)) return false;
  }
  return true;
}
static_assert(EstaEmOrdem(), "the table is read by position");

}  // namespace

std::span<const DescricaoDeMensagem> TodasAsMensagens() { return TabelaDeMensagens; }

bool EhTexto(std::string_view Peca) {
  constexpr std::string_view outras[] = {"", Peca::Linha, Peca::Paragrafo, Peca::Branco, Peca::Valor};
  return std::ranges::find(outras, Peca) == std::end(outras);
}

std::string TextoDaMensagem(Mensagem Qual, const std::string& ComValor) {
  std::string texto;
  for (const std::string_view peca : Descricao(Qual).Pecas) {
    if (EhTexto(peca)) {
      texto += Traduzir(platform::FromUtf8(peca));
    } else {
      texto += peca == Peca::Valor ? std::string_view(ComValor) : peca;
    }
  }
  return texto;
}

std::string TituloDaMensagem(Mensagem Qual) { return Traduzir(platform::FromUtf8(Descricao(Qual).Titulo)); }

platform::Answer MostrarMensagem(Mensagem Qual, const std::string& ComValor) {
  const DescricaoDeMensagem& descricao = Descricao(Qual);
  return platform::MessageBoxA(TextoDaMensagem(Qual, ComValor), TituloDaMensagem(Qual), descricao.Botoes,
                               descricao.Icone);
}
