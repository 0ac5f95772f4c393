#pragma once

// The accounts of this machine. Reads /etc/passwd, and /var/log/lastlog for the last logins.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/software/UserAccount.h"

namespace cimomd {

class AccountProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_Account";

    /// `systemCalls` must outlive the provider.
    AccountProvider(SystemPaths systemPaths, const SystemCalls& systemCalls)
        : paths(std::move(systemPaths)), calls(systemCalls) {}

    const char* className() const override { return kClassName; }
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// `lastLogin` in seconds since 1970, `utcOffsetMinutes` the one at that time.
    static ProvidedInstance publish(const std::string& hostName, const UserAccount& account,
                                    const Fact<std::int64_t>& lastLogin, int utcOffsetMinutes);

  private:
    SystemPaths paths;
    const SystemCalls& calls;
};

}  // namespace cimomd
