// store-stress: applies numbered changes to an existing host store through
// the library, the way many orvixcli processes would. The reliability tests
// start it many times at once, or kill it half-way.
//
//   store-stress counter DB COUNT TAG   COUNT changes, each adding one to the
//                                       counter and putting world "TAG-<i>"
//   store-stress sequence DB FIRST      changes FIRST, FIRST+1, ...: change i
//                                       puts world i and sets the counter to
//                                       i, then prints i; runs until killed
//
// The counter is the "stressCounter" field of the "system" singleton. Both
// modes read-modify-write it inside the same Change() as the world they put,
// so a lost update or a torn change shows as a counter that disagrees with
// the worlds.
#include <cstdlib>
#include <functional>
#include <iostream>
#include <string>

#include "hoststore/HostStore.h"

namespace {

using PldCtl::Store::HostStore;
using PldCtl::Store::Json;
using PldCtl::Store::Transaction;

// A sequence that is never killed still ends, long after any test gave up.
constexpr long kLongestSequence = 1000000;

void Apply(HostStore& store, const Json& world, const std::function<std::int64_t(std::int64_t)>& next) {
    store.Change([&](Transaction& transaction) {
        Json system = transaction.GetSingleton("system");
        system["stressCounter"] = next(system.value("stressCounter", std::int64_t(0)));
        transaction.PutSingleton("system", system);
        transaction.Put("worlds", world);
    });
}

int Usage() {
    std::cerr << "usage: store-stress counter DB COUNT TAG | store-stress sequence DB FIRST\n";
    return 2;
}

}  // namespace

int main(int argc, char** argv) {
    const std::string mode = argc > 1 ? argv[1] : "";
    try {
        if (mode == "counter" && argc == 5) {
            auto store = HostStore::Open(argv[2]);
            const long count = std::atol(argv[3]);
            for (long i = 1; i <= count; ++i) {
                Apply(*store, {{"id", std::string(argv[4]) + "-" + std::to_string(i)}},
                      [](std::int64_t counter) { return counter + 1; });
            }
            return 0;
        }
        if (mode == "sequence" && argc == 4) {
            auto store = HostStore::Open(argv[2]);
            const long first = std::atol(argv[3]);
            for (long i = first; i < first + kLongestSequence; ++i) {
                Apply(*store, {{"id", i}}, [i](std::int64_t) { return i; });
                std::cout << i << std::endl;
            }
            return 0;
        }
    } catch (const std::exception& e) {
        std::cerr << "store-stress: " << e.what() << '\n';
        return 1;
    }
    return Usage();
}
