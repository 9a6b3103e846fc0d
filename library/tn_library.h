// A named library of units: owns them, keyed by name and secondary key.
#ifndef TARN_TN_LIBRARY_H
#define TARN_TN_LIBRARY_H

#include <memory>
#include <unordered_map>
#include <vector>

#include "library/tn_libraryunit.h"

class Tn_Library {
public:
    typedef std::vector<Tn_LibraryUnit*> Units;

    explicit Tn_Library(const Port_String& name);
    virtual ~Tn_Library();
    Tn_Library(const Tn_Library&) = delete;
    Tn_Library& operator=(const Tn_Library&) = delete;

    // Stores the unit (taking ownership); a unit stored under the same key
    // before is deleted. True when the unit was stored.
    virtual bool add(std::unique_ptr<Tn_LibraryUnit> unit);
    virtual Tn_LibraryUnit* find(const Port_String& name, const Port_String& secondaryKey = Port_String());
    // Every unit, in the order they were first added.
    virtual Units units();

    const Port_String& name() const { return name_; }

protected:
    // The in-memory store, for libraries that keep more than memory.
    bool store(std::unique_ptr<Tn_LibraryUnit> unit);
    Tn_LibraryUnit* lookup(const Port_String& name, const Port_String& secondaryKey) const;
    Units stored() const;

private:
    struct Key {
        Port_String name;
        Port_String secondary;
        bool operator==(const Key& o) const { return name == o.name && secondary == o.secondary; }
    };
    struct KeyHash {
        size_t operator()(const Key& k) const {
            return std::hash<Port_String>()(k.name) * 31 + std::hash<Port_String>()(k.secondary);
        }
    };
    Port_String name_;
    std::unordered_map<Key, size_t, KeyHash> index_;
    std::vector<std::unique_ptr<Tn_LibraryUnit>> units_;
};

// Opens libraries by name, creating each on first request; owns them.
class Tn_LibraryManager {
public:
    Tn_LibraryManager();
    virtual ~Tn_LibraryManager();
    Tn_LibraryManager(const Tn_LibraryManager&) = delete;
    Tn_LibraryManager& operator=(const Tn_LibraryManager&) = delete;

    Tn_Library* open(const Port_String& name);

protected:
    virtual std::unique_ptr<Tn_Library> create(const Port_String& name) = 0;

private:
    std::unordered_map<Port_String, std::unique_ptr<Tn_Library>> libraries_;
};

#endif
