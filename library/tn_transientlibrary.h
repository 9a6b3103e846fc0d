// In-memory libraries: what the compile flow parses lives here for one call.
#ifndef TARN_TN_TRANSIENTLIBRARY_H
#define TARN_TN_TRANSIENTLIBRARY_H

#include "library/tn_library.h"

class Tn_TransientLibrary : public Tn_Library {
public:
    using Tn_Library::Tn_Library;
};

class Tn_TransientLibraryManager : public Tn_LibraryManager {
protected:
    std::unique_ptr<Tn_Library> create(const Port_String& name) override {
        return std::unique_ptr<Tn_Library>(new Tn_TransientLibrary(name));
    }
};

#endif
