// Caller data attached to design objects, owned by the root.
#ifndef TARN_TN_VPIUSERDATAMAP_H
#define TARN_TN_VPIUSERDATAMAP_H

#include <memory>
#include <unordered_map>

#include "tarn/tn_vpi.h"

class Tn_VpiUserDataMap {
public:
    // Takes ownership of data (replacing and deleting what key had).
    void put(const void* key, Tn_Vpi::s_data* data) { map_[key].reset(data); }
    Tn_Vpi::s_data* get(const void* key) const {
        auto it = map_.find(key);
        return it == map_.end() ? nullptr : it->second.get();
    }
    size_t size() const { return map_.size(); }

private:
    std::unordered_map<const void*, std::unique_ptr<Tn_Vpi::s_data>> map_;
};

#endif
