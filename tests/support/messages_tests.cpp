// The messages as a person reads them: the one place beside the table where their texts are written out.
#include <gtest/gtest.h>

#include "platform/simulated/simulated.h"
#include "platform/text.h"
#include "support/mensagens.h"
#include "support/mod_Globais.h"

namespace {

using namespace platform;
using simulated::ShownMessage;

const ShownMessage Expected[] = {
    {"O Tolvaris não foi configurado.\r\nClique em 'Sim' para rodar o programa de auto-configuração."_ansi,
     "Configuração"_ansi, Buttons::YesNoCancel, Icon::Information},
    {"Não foi possível configurar o Tolvaris, o programa de auto-configuração não foi encontrado.\r\nReinstale o programa."_ansi,
     "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Guarde os comandos do controle. Se necessário anote-os."_ansi, "Informação"_ansi, Buttons::Ok, Icon::Information},
    {"Erro interno: jogo não encontrado no sistema."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"O jogo não foi encontrado."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"O nome do arquivo do jogo tem letras que o Tolvaris não pode usar neste Windows.\r\nMude o nome do arquivo e abra o Tolvaris de novo."_ansi,
     "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"O emulador ZSnes não foi encontrado."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Não há disquete na unidade A:\\\r\n\r\nColoque um disquete e clique em 'Repetir'."_ansi, "Disquete A:"_ansi,
     Buttons::RetryCancel, Icon::Exclamation},
    {"Para fechar o jogo precione e segure a tecla 'ALT' e simultaneamente aperte e tecla 'F4'"_ansi, "Informação"_ansi,
     Buttons::Ok, Icon::Information},
    {"Jogo adicionado com sucesso."_ansi, "Ok"_ansi, Buttons::Ok, Icon::Information},
    {"O jogo a ser adiciona já existe.\r\n\r\nSubstituir ?"_ansi, "Confirmar"_ansi, Buttons::YesNoCancel,
     Icon::Exclamation},
    {"Houve uma diferença na medição dos códigos CRC.\r\nEssa mudança indica que o arquivo está corrompido."_ansi,
     "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Erro ao ler arquivo."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Erro ao gravar arquivo."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Erro ao salvar arquivo."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Arquivo já existente.\r\n\r\nSubstituir ?"_ansi, "Confirmar"_ansi, Buttons::YesNoCancel, Icon::Exclamation},
    {"Arquivo salvo."_ansi, "Ok"_ansi, Buttons::Ok, Icon::Information},
    {"Deletar o jogo ' Valor ' ?"_ansi, "Confirmar deleção"_ansi, Buttons::YesNoCancel, Icon::Exclamation},
    {"O programa de download não foi encontrado."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Não há espaço livre suficiente em disco para completar a operação."_ansi, "Disco cheio"_ansi, Buttons::Ok,
     Icon::Exclamation},
    {"O salvamento selecionado já se encontra no Disquete (A:).\r\nVocê deseja substituí-lo ?"_ansi,
     "Salvamento já existente"_ansi, Buttons::YesNoCancel, Icon::Question},
    {"O salvamento selecionado já se encontra no Computador.\r\nVocê deseja substituí-lo ?"_ansi,
     "Salvamento já existente"_ansi, Buttons::YesNoCancel, Icon::Question},
    {"Deletar o salvamento do jogo 'Valor' que está no Disquete (A:) ?"_ansi, "Confirmar deleção"_ansi,
     Buttons::YesNoCancel, Icon::Question},
    {"Deletar o salvamento do jogo 'Valor' que está no Computador ?"_ansi, "Confirmar deleção"_ansi,
     Buttons::YesNoCancel, Icon::Question},
    {"O caminho é longo demais: o Tolvaris lê no máximo 254 caracteres.\r\n\r\nValor"_ansi, "Erro"_ansi, Buttons::Ok,
     Icon::Critical},
    {"O caminho está em uma rede: dê uma letra de unidade a ele.\r\n\r\nValor"_ansi, "Erro"_ansi, Buttons::Ok,
     Icon::Critical},
    {"Este emulador é um programa do DOS, que o Windows de 64 bits não inicia.\r\nEscolha o emulador feito para o Windows (zsnesw.exe).\r\n\r\nValor"_ansi,
     "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Este emulador guarda a configuração em uma forma mais nova, que o Tolvaris não altera ao jogar.\r\nCom ele a opção de usar disquete não tem efeito.\r\n\r\nGravar agora nessa configuração os diretórios de jogos e de salvamentos do Tolvaris ?"_ansi,
     "Confirmar"_ansi, Buttons::YesNoCancel, Icon::Question},
    {"O Windows não deixa o Tolvaris gravar a configuração deste emulador: ele não usará os diretórios do Tolvaris nem o disquete.\r\nPonha o emulador em um diretório seu, como C:\\ZSNES, e escolha-o de novo.\r\n\r\nValor"_ansi,
     "Informação"_ansi, Buttons::Ok, Icon::Exclamation},
    {"Erro ao gravar arquivo.\r\n\r\nValor"_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
    {"Não foi possível gravar a configuração."_ansi, "Erro"_ansi, Buttons::Ok, Icon::Critical},
};

TEST(Messages, SayWhatTheyAlwaysSaid) {
  simulated::Reset();
  ArquivoIdioma.clear();
  ASSERT_EQ(TodasAsMensagens().size(), std::size(Expected));
  for (const DescricaoDeMensagem& each : TodasAsMensagens()) {
    MostrarMensagem(each.Qual, "Valor");
    const ShownMessage &shown = simulated::ShownMessages().back(), &expected = Expected[static_cast<int>(each.Qual)];
    EXPECT_EQ(shown.Text, expected.Text) << each.Nome;
    EXPECT_EQ(shown.Title, expected.Title) << each.Nome;
    EXPECT_EQ(shown.Choice, expected.Choice) << each.Nome;
    EXPECT_EQ(shown.Symbol, expected.Symbol) << each.Nome;
  }
}

}  // namespace
