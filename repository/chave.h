// A repository's key: one key is one repository.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "platform/signature.h"

// The bytes of a key file: PKCS #8 in PEM, as other programs for keys read and write it.
std::string EscreverChave(const platform::SigningKey& Chave);

// Nothing for a file that is not as EscreverChave makes it, but for line ends with CR; the two parts of the key need
// not belong together.
std::optional<platform::SigningKey> LerChave(std::string_view Conteudo);

// The SHA-256 of a public key, in hexadecimal digits, by which people compare keys; nothing when the system computes
// none.
std::optional<std::string> ImpressaoDigital(const platform::PublicKey& Chave);
