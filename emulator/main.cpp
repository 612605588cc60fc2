#include "control.h"
#include "http/faults.h"
#include "http/httpsserver.h"
#include "http/utf8path.h"
#include "options.h"
#include "platform.h"
#include "platform/crypto/nvlcrypto.h"
#include "service.h"
#include "stopsignal.h"
#include "tables/credentials.h"
#include "tables/servicefiles.h"

#include <cstdlib>
#include <filesystem>
#include <future>
#include <iostream>
#include <string>
#include <vector>

namespace {

using namespace std::chrono_literals;

constexpr int usageStatus = 2;

void useKeyOf(const std::filesystem::path &folder) {
    const std::string path = emulator::utf8(folder);
    nvlcryptoSetKeyFolder(path.data(), path.size());
    if (!emulator::ciphersWork())
        throw std::runtime_error("the key file in " + path + " cannot be used");
}

void runLoop(emulator::Service &service, const emulator::StopSignal &stop) {
    while (!stop.waitFor(service.timeUntilNextWork())) {
        try {
            service.runDueWork();
        } catch (const std::exception &error) {
            std::cerr << std::string("nvldm-emulator: a tick failed: ") + error.what() + "\n";
        }
    }
}

/// A caller that stalls in the middle of its request must not keep the program running; the store is
/// consistent at any time.
void leaveWithin(const std::future<void> &ended, const emulator::ServiceFiles &files) {
    files.writeStopped();
    if (ended.wait_for(3s) != std::future_status::ready)
        std::_Exit(0);
}

int serve(const emulator::Options &options) {
    const emulator::ServiceFiles files(options.root);
    if (options.fresh)
        files.discardStore();
    if (options.newKey)
        files.discardIdentity();
    useKeyOf(options.root);
    emulator::Faults faults(options.seed);
    for (const std::string &fault : options.faults)
        faults.add(fault);
    emulator::Service service(options, files.storePath());
    emulator::StopSignal stop;
    emulator::ServerRules rules;
    rules.latencyMs = options.latencyMs;
    rules.limits.upload = options.uploadLimit;
    emulator::HttpsServer server(service, faults, stop, rules,
                                 emulator::loadServerIdentity(files.identityPath()));
    const int port = server.bind(options.host, options.port, files.lastPort());
    files.writePort(port);
    files.writeRunning();
    const auto serving = std::async(std::launch::async, [&] { server.serve(); });
    const auto simulating = std::async(std::launch::async, [&] { runLoop(service, stop); });
    const emulator::Control control(service, faults, stop);
    server.waitUntilServing();
    std::cout << "nvldm-emulator: listening on https://" << options.host << ':' << port << std::endl;
    emulator::platform::waitForStop();
    service.noteStop();
    stop.raise();
    server.stop();
    leaveWithin(serving, files);
    return 0;
}

int run(const emulator::Options &options) {
    if (options.help) {
        std::cout << emulator::helpText();
        return 0;
    }
    if (options.version) {
        std::cout << "nvldm-emulator " NVLDM_VERSION "\n";
        return 0;
    }
    for (const std::string &fault : options.faults)
        emulator::readFault(fault);
    return serve(options);
}

} // namespace

int main(int argc, char *argv[]) {
    emulator::platform::prepare();
    try {
        return run(emulator::readOptions({argv + 1, argv + argc}));
    } catch (const emulator::UsageError &error) {
        std::cerr << "nvldm-emulator: " << error.what() << " (see --help)\n";
        return usageStatus;
    } catch (const emulator::FaultError &error) {
        std::cerr << "nvldm-emulator: --fault: " << error.what() << " (see --help)\n";
        return usageStatus;
    } catch (const std::exception &error) {
        std::cerr << "nvldm-emulator: " << error.what() << '\n';
        return 1;
    }
}
