#include <initializer_list>

#include "package/pacote.h"

std::string MontarPacote(std::string_view Nome, std::string_view DOSName, std::string_view CRC,
                         std::int64_t TamanhoImagem, std::int64_t TamanhoRom, std::string_view Imagem,
                         std::string_view Rom) {
  const std::string tImg = std::to_string(TamanhoImagem);
  const std::string iRom = std::to_string(TamanhoImagem + 1);
  const std::string tRom = std::to_string(TamanhoRom);
  const std::initializer_list<std::string_view> partes = {"TOLVARIS\r\n",                   //
                                                          "NOME=",        Nome,    "\r\n",  //
                                                          "NOMEDOS=",     DOSName, "\r\n",  //
                                                          "CRC=",         CRC,     "\r\n",  //
                                                          "iIMG=1\r\n",                     //
                                                          "tIMG=",        tImg,    "\r\n",  //
                                                          "iROM=",        iRom,    "\r\n",  //
                                                          "tROM=",        tRom,    "\r\n",  //
                                                          "|IMGROMDAT|",  Imagem,  Rom};
  std::size_t total = 0;
  for (const std::string_view parte : partes) total += parte.size();
  std::string pacote;
  pacote.reserve(total);
  for (const std::string_view parte : partes) pacote += parte;
  return pacote;
}
