#include <gtest/gtest.h>

#include <random>
#include <string>

#include "catalog/busca.h"
#include "catalog/indice.h"

namespace {

// A text of few characters, so that keys, names and broken entries meet often.
std::string RandomText(std::mt19937& random, std::size_t longest) {
  std::string text(random() % (longest + 1), ' ');
  for (char& c : text) c = "|=abAB|="[random() % 8];
  return text;
}

TEST(CatalogueIndex, AnswersAsThePlainSearchDoes) {
  std::mt19937 random(20);
  std::size_t found = 0;
  for (std::size_t i = 0; i < 3000; ++i) {
    const std::string data = RandomText(random, i % 100);
    const Indice index(data);
    for (int j = 0; j < 40; ++j) {
      // Half of the lookups are for a piece of the text itself.
      const bool fromData = j % 2 == 0 && !data.empty();
      const std::string wanted = fromData ? data.substr(random() % data.size(), random() % 7) : RandomText(random, 4);
      const auto name = BuscarNome(data, wanted), key = BuscarChave(data, wanted);
      ASSERT_EQ(index.Nome(wanted), name) << data << " key " << wanted;
      ASSERT_EQ(index.Chave(wanted), key) << data << " name " << wanted;
      if (name || key) ++found;
    }
  }
  EXPECT_GT(found, 20000U);
  EXPECT_LT(found, 100000U);
}

}  // namespace
