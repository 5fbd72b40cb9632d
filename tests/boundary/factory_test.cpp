// The factory hands out independent reader-writers for type 0 and nothing else.
#include <gtest/gtest.h>

#include <memory>

#include "redavudeva/swatchlog_factory.h"

namespace {

using Factory = CSwatchlogFactory;

TEST(Factory, TypeZeroGivesIndependentObjects) {
    std::unique_ptr<CSwatchlogBase> first(Factory::GetReaderWriter(Factory::READERWRITER_IT8));
    std::unique_ptr<CSwatchlogBase> second(Factory::GetReaderWriter(Factory::READERWRITER_IT8));
    ASSERT_NE(first, nullptr);
    ASSERT_NE(second, nullptr);
    EXPECT_NE(first.get(), second.get());

    EXPECT_EQ(first->SetLayout(2, 3), 0);
    first.reset(); // deleting one leaves the other usable
    EXPECT_EQ(second->GetNumberOfStrips(), 0);
}

TEST(Factory, OtherTypesGiveNothing) {
    for (int type : {1, -1, 2, 1000}) {
        EXPECT_EQ(Factory::GetReaderWriter(static_cast<Factory::enumReaderwriterType>(type)),
                  nullptr)
            << type;
    }
}

} // namespace
