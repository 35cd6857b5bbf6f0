#include <gtest/gtest.h>

#include "platform/signature.h"

namespace {

using platform::Sign;
using platform::VerifySignature;

TEST(Signatures, ConfirmTheirOwnBytesUnderTheirOwnKeyOnly) {
  const auto made = platform::MakeSigningKey(), another = platform::MakeSigningKey();
  ASSERT_TRUE(made && another);
  EXPECT_NE(made->Public, another->Public);
  const auto signature = Sign(*made, "some bytes");
  ASSERT_TRUE(signature);
  EXPECT_TRUE(VerifySignature(made->Public, "some bytes", *signature));
  EXPECT_FALSE(VerifySignature(made->Public, "some byteS", *signature));
  EXPECT_FALSE(VerifySignature(made->Public, "", *signature));
  EXPECT_FALSE(VerifySignature(another->Public, "some bytes", *signature));
  for (const std::size_t place : {0U, 31U, 32U, 63U}) {
    platform::Signature changed = *signature;
    changed[place] ^= 1;
    EXPECT_FALSE(VerifySignature(made->Public, "some bytes", changed)) << place;
  }
  EXPECT_FALSE(VerifySignature(made->Public, "some bytes", {}));
}

TEST(Signatures, TakeNoMalformedKey) {
  const auto made = platform::MakeSigningKey(), another = platform::MakeSigningKey();
  ASSERT_TRUE(made && another);
  const auto signature = Sign(*made, "bytes");
  ASSERT_TRUE(signature);
  for (const std::size_t place : {0U, 1U, 33U, 64U}) {  // the kind of key, and both ends of the point
    platform::PublicKey changed = made->Public;
    changed[place] ^= 1;
    EXPECT_FALSE(VerifySignature(changed, "bytes", *signature)) << place;
  }
  EXPECT_FALSE(VerifySignature({4}, "bytes", *signature));
  EXPECT_FALSE(VerifySignature({}, "bytes", *signature));
  EXPECT_FALSE(Sign({made->Secret, another->Public}, "bytes")) << "the parts are of two keys";
  EXPECT_FALSE(Sign({{}, made->Public}, "bytes"));
}

}  // namespace
