#pragma once

// A record kind and operations that exist only in the unit tests, to drive
// the store without depending on any facade; and what the default host holds.

#include <string>
#include <vector>

#include <nlohmann/json.hpp>

#include "trellis/host/Description.h"
#include "trellis/host/JsonReader.h"
#include "trellis/host/Operation.h"

struct CounterRecord {
    static constexpr const char* kKind = "test.counter";

    std::string name;
    int value = 0;

    Trellis::Host::Json ToJson() const { return {{"name", name}, {"value", value}}; }
    static CounterRecord FromJson(const Trellis::Host::JsonReader& in) {
        CounterRecord record{in.String("name"), static_cast<int>(in.Int("value", 0, 1000000))};
        in.RejectUnknownMembers();
        return record;
    }
};

inline const Trellis::Host::Operation kIncrement("HostTest::Increment");
inline const Trellis::Host::Operation kReadCounter("HostTest::ReadCounter");

// Adds one to the counter name (creating it at 1) in one write operation.
inline void Increment(const std::string& name) {
    kIncrement.Write([&](Trellis::Host::Transaction& t) {
        CounterRecord counter = t.Find<CounterRecord>(name).value_or(CounterRecord{name, 0});
        ++counter.value;
        t.Put(counter);
    });
}

inline int CounterValue(const std::string& name) {
    return kReadCounter.Read([&](Trellis::Host::Transaction& t) {
        return t.Find<CounterRecord>(name).value_or(CounterRecord{name, 0}).value;
    });
}

// The labels of the default host's rulesets, in their order.
inline std::vector<std::string> DefaultRulesetNames() {
    const nlohmann::json host = nlohmann::json::parse(Trellis::Host::kDefaultHostDescription);
    std::vector<std::string> names;
    for (const auto& ruleset : host["firewall"]["rulesets"]) names.push_back(ruleset["name"]);
    return names;
}
