#include "providers/software/AccountProvider.h"

#include "providers/CimTime.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/computer/SystemIdentity.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;

constexpr std::size_t kNumberLength = 256;

Fact<std::vector<std::string>> orNothing(const std::vector<std::string>& texts) {
    return texts.empty() ? Fact<std::vector<std::string>>() : Fact(std::optional(texts));
}

}  // namespace

std::unique_ptr<InstanceStream> AccountProvider::enumerate() const {
    Fact<std::vector<UserAccount>> accounts = readUserAccounts(paths.accounts());
    if (!accounts)
        return std::make_unique<EmptyStream>(accounts.reason());
    return std::make_unique<RecordStream<UserAccount>>(
        std::move(*accounts), [hostName = readHostName(paths), logins = paths.lastLogins(),
                               &clock = calls](const UserAccount& account) {
            const Fact<std::int64_t> lastLogin = readLastLogin(logins, account.userId);
            return publish(hostName, account, lastLogin,
                           clock.utcOffsetMinutes(lastLogin.value_or(0)));
        });
}

ProvidedInstance AccountProvider::publish(const std::string& hostName, const UserAccount& account,
                                          const Fact<std::int64_t>& lastLogin,
                                          int utcOffsetMinutes) {
    InstanceBuilder builder(kClassName);
    builder.label(account.comments.empty() ? account.name : account.comments.front())
        .values<Uint16>("OperationalStatus", Fact<std::vector<Uint16>>())
        .value<Uint16>("EnabledState", Fact<Uint16>())
        .serviceKeys(hostName, account.name)
        .text("UserID", std::to_string(account.userId), kNumberLength)
        .texts("Descriptions", orNothing(account.comments))
        .texts("Host", std::vector{hostName})
        .value<Pegasus::CIMDateTime>("LastLogin",
                                     lastLogin.then([utcOffsetMinutes](std::int64_t time) {
                                         return cimTimeOf(time, utcOffsetMinutes);
                                     }))
        .text("PrimaryGroupID", std::to_string(account.groupId), kNumberLength)
        .text("HomeDirectory", account.homeDirectory)
        .text("LoginShell", account.shell);
    return builder.take();
}

}  // namespace cimomd
