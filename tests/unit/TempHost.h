#pragma once

// A host of its own for one test: a fresh temporary directory with a host
// store in it, opened for the process (OpenHost) while the TempHost lives,
// then closed and removed.
//
//   TEST(FirewallGet, UnloadedModule) {
//       TempHost host([](Json& d) { d["modules"][0]["loaded"] = false; });
//       ... run the command ...
//   }

#include <stdlib.h>

#include <filesystem>
#include <functional>
#include <stdexcept>
#include <string>

#include <nlohmann/json.hpp>

#include "trellis/host/Description.h"
#include "trellis/host/HostSession.h"
#include "trellis/host/JsonReader.h"

class TempHost {
public:
    using Json = Trellis::Host::Json;

    // The default host.
    TempHost() : TempHost(std::string()) {}

    // A host from a description (JSON text); an empty text means the default host.
    explicit TempHost(const std::string& description) {
        std::string pattern = (std::filesystem::temp_directory_path() / "halden-test-XXXXXX").string();
        if (!::mkdtemp(pattern.data())) throw std::runtime_error("mkdtemp failed");
        dir_ = pattern;
        path_ = dir_ + "/host.db";
        Trellis::Host::OpenHost(path_);
        if (!description.empty()) Trellis::Host::ImportHost(description);
    }

    // The default host, changed by edit before it is imported.
    explicit TempHost(const std::function<void(Json&)>& edit) : TempHost(Edited(edit)) {}

    ~TempHost() {
        Trellis::Host::CloseHost();
        std::error_code ignored;
        std::filesystem::remove_all(dir_, ignored);
    }

    TempHost(const TempHost&) = delete;
    TempHost& operator=(const TempHost&) = delete;

    const std::string& Path() const { return path_; }
    const std::string& Dir() const { return dir_; }

    // Opens this host again for the process (after a test closed it, e.g.
    // to fork processes that open it themselves).
    void Reopen() const { Trellis::Host::OpenHost(path_); }

    static std::string Edited(const std::function<void(Json&)>& edit) {
        Json description = Json::parse(Trellis::Host::kDefaultHostDescription);
        edit(description);
        return description.dump(2);
    }

private:
    std::string dir_;
    std::string path_;
};
