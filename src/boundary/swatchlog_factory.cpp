#include "redavudeva/swatchlog_factory.h"

#include <memory>

#include "it8/it8_reader_writer.h"

CSwatchlogFactory::CSwatchlogFactory() = default;

CSwatchlogFactory::~CSwatchlogFactory() = default;

CSwatchlogFactory& CSwatchlogFactory::operator=(const CSwatchlogFactory&) {
    return *this;
}

CSwatchlogBase* CSwatchlogFactory::GetReaderWriter(enumReaderwriterType type) {
    if (type != READERWRITER_IT8) {
        return nullptr;
    }
    // The host owns the object and deletes it through the virtual destructor,
    // which frees it with this library's own deallocator.
    return std::make_unique<CIT8ReaderWriter>().release();
}
