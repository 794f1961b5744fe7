// Frees a vector of objects the library handed out, whichever way they are
// held: raw pointers are deleted (null ones skipped), owning pointers
// released. Either way the vector is empty afterwards, so a second call, or
// a loop over it by mistake, finds nothing to free twice.
#pragma once

#include <memory>
#include <vector>

namespace PldCtl {
namespace Util {

template <typename T>
void DeleteVector(std::vector<T*>& objects) {
    for (T*& object : objects) {
        delete object;
        object = nullptr;
    }
    objects.clear();
}

template <typename T, typename Deleter>
void DeleteVector(std::vector<std::unique_ptr<T, Deleter>>& objects) {
    objects.clear();
}

}  // namespace Util
}  // namespace PldCtl
