// Texts that people write with other programs: UTF-8, with its mark or without, or the ANSI code page.
#pragma once

#include <string>
#include <string_view>

// The content in UTF-8, without the mark. What is not valid UTF-8 is taken for the ANSI code page.
std::string EmUtf8(std::string_view Conteudo);
