// mod_Tradução: the texts that the person sees.
#pragma once

#include <string>

// The translation that the translation file holds for the text, or the text itself.
std::string Traduzir(const std::string& Texto);

// A value of the translation file, at most 254 characters, without one bar at each end; empty when there is none.
std::string LerIni(const std::string& Secao, const std::string& Chave);

// The program's title, which is never translated.
std::string TituloPrograma();
