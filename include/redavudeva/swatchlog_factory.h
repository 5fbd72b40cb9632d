// CSwatchlogFactory: creates chart reader-writers.
#pragma once

#include "redavudeva/export.h"
#include "redavudeva/swatchlog_base.h"

class REDAVUDEVA_API CSwatchlogFactory {
public:
    enum enumReaderwriterType { READERWRITER_IT8 = 0 };

    CSwatchlogFactory();
    ~CSwatchlogFactory();
    CSwatchlogFactory& operator=(const CSwatchlogFactory& other);

    /// A new IT8.7 / CGATS.17 reader-writer for READERWRITER_IT8, else nullptr.
    /// The caller owns the object and deletes it through CSwatchlogBase.
    static CSwatchlogBase* GetReaderWriter(enumReaderwriterType type);
};
