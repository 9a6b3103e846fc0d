#include "library/tn_library.h"

Tn_Library::Tn_Library(const Port_String& name) : name_(name), index_(100) {}

Tn_Library::~Tn_Library() {}

bool Tn_Library::add(std::unique_ptr<Tn_LibraryUnit> unit) { return store(std::move(unit)); }

Tn_LibraryUnit* Tn_Library::find(const Port_String& name, const Port_String& secondaryKey) {
    return lookup(name, secondaryKey);
}

Tn_Library::Units Tn_Library::units() { return stored(); }

bool Tn_Library::store(std::unique_ptr<Tn_LibraryUnit> unit) {
    if (!unit) return false;
    Key key{unit->name(), unit->secondaryName()};
    auto it = index_.find(key);
    if (it != index_.end()) {
        units_[it->second] = std::move(unit);  // the earlier unit goes
        return true;
    }
    index_.emplace(std::move(key), units_.size());
    units_.push_back(std::move(unit));
    return true;
}

Tn_LibraryUnit* Tn_Library::lookup(const Port_String& name, const Port_String& secondaryKey) const {
    auto it = index_.find(Key{name, secondaryKey});
    return it == index_.end() ? nullptr : units_[it->second].get();
}

Tn_Library::Units Tn_Library::stored() const {
    Units r;
    r.reserve(units_.size());
    for (const auto& u : units_) r.push_back(u.get());
    return r;
}

Tn_LibraryManager::Tn_LibraryManager() : libraries_(100) {}

Tn_LibraryManager::~Tn_LibraryManager() {}

Tn_Library* Tn_LibraryManager::open(const Port_String& name) {
    auto it = libraries_.find(name);
    if (it != libraries_.end()) return it->second.get();
    std::unique_ptr<Tn_Library> lib = create(name);
    Tn_Library* raw = lib.get();
    libraries_.emplace(name, std::move(lib));
    return raw;
}
