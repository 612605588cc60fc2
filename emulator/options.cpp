#include "options.h"

#include "controlcommands.h"
#include "http/utf8path.h"

#include <charconv>
#include <functional>
#include <map>
#include <optional>

namespace emulator {

namespace {

constexpr auto optionsHelp =
    R"(Usage: nvldm-emulator --root DIR [option]...

Plays the device manager service and its fleet over HTTPS.

Address and store
  --root DIR            folder of the service's files and of the emulator's store (made when missing)
  --host ADDRESS        address to listen on (127.0.0.1)
  --port N              port to listen on; 0: that of the last run, or a free one (0)
  --fresh               throw an existing store away; without it the store's fleet is kept
  --new-key             make another key and certificate for the server, in place of those kept in DIR as
                        nvldm-emulator.pem, like a service that was installed again
Fleet
  --devices N           devices of a new fleet (500)
  --sites N             sites of a new fleet (12)
  --seed N              the same seed makes the same fleet and the same changes to it (1)
  --malformed-devices   add records with missing, wrong and hostile members
  --life MS             length of a tick, in which the fleet changes by itself; 0 for no change (1000)
Past of a new fleet
  --tasks N             tasks that have ended in the last days (0)
  --task-devices N      devices of each of them (20)
  --alarms N            alarms that have not been removed (0); at most 5000 are kept
  --log-entries N       log entries of the last 8 days (0); at most 200000 are kept
Tasks
  --task-pace MS        length of a step; the work on a device takes 6 to 8 of them (1000)
  --task-failures P     share of the devices that fail by chance (0)
  --task-work-timeout MS
                        how long a task waits for its work (120000)
Accounts
  --account EMAIL:PASSWORD[:PERMISSION]
                        have this account (admin, operator or viewer; admin when left out); repeatable.
                        Without one a new store holds the factory account "admin", password "admin"
  --session-limit N     sessions at a time; a login beyond gets the code 108; 0 is no limit (0)
Remote-access service
  --orb-user EMAIL:PASSWORD[:expired]
                        a user who can sign in there; repeatable. Without one: partner@norvell.example with
                        the password "Partner-1", and expired@norvell.example, whose same password is expired
  --orb-sign-in MS      how long a sign-in there lasts (600000)
Behaviour
  --latency MS          added to each response
  --upload-limit BYTES  maximum size of a form; a larger one gets the status 413 (8 GiB)
  --batch-timeout MS    life of a commit that was started and not ended (60000)
  --token-grace MS      how long a token stays good after its renewal (60000)
  --block-time MS       how long a device blocks its account after five wrong passwords (60000)
  --fault FAULT         respond badly; repeatable
  --help, --version

FAULT is KIND[=VALUE][@PATH][,after=N][,times=N][,rate=P]. It hits requests whose path begins with PATH (all
when left out), not the first N of them (after), at most N times (times), each with the probability P (rate).
  no-answer             take the request and never respond
  late=MS               respond MS later
  reset                 send half of the body, then reset the connection
  status=N              respond with this HTTP status and do nothing
  not-json              do the work, respond with something that is not JSON
  wrong-types[=WHERE]   members have other JSON types; WHERE: members (default), data, code
  no-data               leave "data" out
  bad-cipher            ciphered "data" does not decipher
  code=N                respond with this code and do nothing
  renew                 renew the session token with every response
  expire                forget every session before the request is judged
  drip                  send the body one byte a second
  early=N               respond with this HTTP status before the body is read, then reset the connection
  cut-body=N            read N bytes of the request's body, then reset the connection
  slow-body=N           read the request's body with N KiB a second
)";

constexpr auto notes =
    R"(An account may do what its permission grants: a viewer changes nothing, an operator all but the link with the
remote-access service, which is the administrators'; anything else gets the code 5.

Unmanaged devices answer scans at 10.99.0.10 to 10.99.0.49. A device lets the account "root" in
with any password of 8 characters or more until one is set, then with that one alone; it denies other accounts,
and five wrong passwords block the account for a minute. A device in "Set Password" wants a first password before
anything else. Each device has the accounts "root" and "admin"; a new password of "root" shuts the service out.

Tasks run on 20 devices at a time; devices that have not let the service in fail. A device that is ordered to
restart or restore, or gets a configuration or firmware, is away for three steps, which raises no alarm. The
network is 255.255.0.0; its DHCP server gives addresses from x.y.192.1 on.

Uploads are hashed while they arrive and not kept. A firmware image may begin with the line
  NVLFW1 MODEL[,MODEL...] VERSION
and fits the models that begin with one of these then, unless their firmware has a higher first number; other
files fit every model. A device has four slots for packages.
)";

template <typename Number>
Number numberOf(const std::string &name, const std::string &text, Number min, Number max) {
    Number value{};
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    const bool isWithin = value >= min && value <= max;
    if (error != std::errc() || end != text.data() + text.size() || !isWithin)
        throw UsageError(name + " takes a number from " + std::to_string(min) + " to " + std::to_string(max));
    return value;
}

template <typename Number>
std::function<void(const std::string &)> numberInto(const std::string &name, Number &target, Number max) {
    return [name, &target, max](const std::string &text) {
        target = numberOf<Number>(name, text, Number{0}, max);
    };
}

StartAccount accountOf(const std::string &text) {
    const auto afterEmail = text.find(':');
    if (afterEmail == 0 || afterEmail == std::string::npos)
        throw UsageError("--account takes EMAIL:PASSWORD[:PERMISSION]");
    StartAccount account{text.substr(0, afterEmail), text.substr(afterEmail + 1), "admin"};
    // The permission is a closed set, so a password may hold colons.
    for (const std::string permission : {"admin", "operator", "viewer"}) {
        const std::string suffix = ":" + permission;
        if (account.password.ends_with(suffix)) {
            account.password.erase(account.password.size() - suffix.size());
            account.permission = permission;
            break;
        }
    }
    if (account.password.empty())
        throw UsageError("--account takes EMAIL:PASSWORD[:PERMISSION]");
    return account;
}

OrbUser orbUserOf(const std::string &text) {
    const auto afterEmail = text.find(':');
    OrbUser user{text.substr(0, afterEmail),
                 afterEmail == std::string::npos ? "" : text.substr(afterEmail + 1)};
    if (const std::string suffix = ":expired"; user.password.ends_with(suffix)) {
        user.password.erase(user.password.size() - suffix.size());
        user.expired = true;
    }
    if (user.email.empty() || user.password.empty())
        throw UsageError("--orb-user takes EMAIL:PASSWORD[:expired]");
    return user;
}

using Setters = std::map<std::string, std::function<void(const std::string &)>>;

Setters valueSetters(Options &options) {
    constexpr int maxMs = 3600000;
    constexpr std::int64_t maxHold = 3600000;
    return {
        {"--host", [&](const std::string &text) { options.host = text; }},
        {"--port", numberInto("--port", options.port, 65535)},
        {"--devices", numberInto<std::size_t>("--devices", options.devices, 200000)},
        {"--sites", numberInto<std::size_t>("--sites", options.sites, 5000)},
        {"--seed", numberInto<std::uint64_t>("--seed", options.seed, UINT64_MAX)},
        {"--root", [&](const std::string &text) { options.root = pathOf(text); }},
        {"--latency", numberInto("--latency", options.latencyMs, maxMs)},
        {"--upload-limit", numberInto<std::uint64_t>("--upload-limit", options.uploadLimit, UINT64_MAX)},
        {"--life", numberInto("--life", options.lifeMs, maxMs)},
        {"--session-limit", numberInto<std::size_t>("--session-limit", options.sessionLimit, 1000000)},
        {"--batch-timeout", numberInto("--batch-timeout", options.batchTimeoutMs, maxHold)},
        {"--token-grace", numberInto("--token-grace", options.tokenGraceMs, maxHold)},
        {"--block-time", numberInto("--block-time", options.blockMs, maxHold)},
        {"--task-pace", numberInto("--task-pace", options.taskPaceMs, maxHold)},
        {"--task-work-timeout", numberInto("--task-work-timeout", options.taskWorkTimeoutMs, maxHold)},
        {"--task-failures", numberInto("--task-failures", options.taskFailures, 1.0)},
        {"--tasks", numberInto<std::size_t>("--tasks", options.tasks, 20000)},
        {"--task-devices", numberInto<std::size_t>("--task-devices", options.taskDevices, 1000)},
        {"--alarms", numberInto<std::size_t>("--alarms", options.alarms, 5000)},
        {"--log-entries", numberInto<std::size_t>("--log-entries", options.logEntries, 200000)},
        {"--fault", [&](const std::string &text) { options.faults.push_back(text); }},
        {"--orb-sign-in", numberInto("--orb-sign-in", options.orbSignInMs, maxHold)},
        {"--orb-user", [&](const std::string &text) { options.orbUsers.push_back(orbUserOf(text)); }},
        {"--account", [&](const std::string &text) { options.accounts.push_back(accountOf(text)); }},
    };
}

std::map<std::string, bool *> switches(Options &options) {
    return {{"--fresh", &options.fresh},
            {"--new-key", &options.newKey},
            {"--malformed-devices", &options.malformedDevices},
            {"--help", &options.help},
            {"--version", &options.version}};
}

} // namespace

Options readOptions(const std::vector<std::string> &arguments) {
    Options options;
    const Setters values = valueSetters(options);
    const auto flags = switches(options);
    for (std::size_t i = 0; i < arguments.size(); ++i) {
        const std::string &argument = arguments[i];
        const auto equals = argument.starts_with("--") ? argument.find('=') : std::string::npos;
        const std::string name = argument.substr(0, equals);
        if (const auto flag = flags.find(argument); flag != flags.end())
            *flag->second = true;
        else if (const auto value = values.find(name); value == values.end())
            throw UsageError("unknown option " + argument);
        else if (equals != std::string::npos)
            value->second(argument.substr(equals + 1));
        else if (i + 1 == arguments.size())
            throw UsageError(name + " needs a value");
        else
            value->second(arguments[++i]);
    }
    if (options.root.empty() && !options.help && !options.version)
        throw UsageError("a folder is needed: --root DIR");
    return options;
}

std::string helpText() {
    return std::string(optionsHelp) +
           "\nCommands on standard input, one a line, each with a response on standard error whose last line "
           "begins "
           "with\n\"ok\" or \"error\":\n" +
           controlHelp() + '\n' + notes;
}

} // namespace emulator
