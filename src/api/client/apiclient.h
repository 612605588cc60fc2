#pragma once

#include "api/client/apiresult.h"
#include "platform/json.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

struct HttpResponse;
struct HttpRequest;
struct UploadPart;
class Transfer;
struct OrbServiceStatus;

/// One request to the device manager service.
///
/// A short-lived object: construct it with the service's address, set account and token, call one method,
/// look at its result, destroy it. Every method opens its own HTTPS connection, blocks for at most a minute
/// (a transfer of files: as long as there is progress within a minute), and returns an ApiResult; no
/// exception leaves it. Used by one thread for one call.
///
/// Unless a method says otherwise it needs a token and an account (ApiInvalidArgument without them, nothing
/// sent), and outputs are filled only with ApiOk.
class CApiClient {
public:
    /// host: IPv4 address or host name; null counts as empty.
    CApiClient(const char *szHost, std::uint32_t uPort);
    virtual ~CApiClient();
    CApiClient(const CApiClient &) = delete;
    CApiClient &operator=(const CApiClient &) = delete;

    /// Takes the token as the local store keeps it, in cipher form. False for null and for what does not
    /// decipher.
    bool setAccessToken(const char *szToken);
    /// False for null.
    bool setAccount(const char *szAccount);
    /// Sends only to a server whose public key has this fingerprint, as serverKey() gives it; to any for an
    /// empty one. With another key a call ends with ApiKeyChanged.
    void expectServerKey(std::string fingerprint) { m_strExpectedKey = std::move(fingerprint); }
    /// The fingerprint that the server has shown in the last call; empty when it did not come that far.
    const std::string &serverKey() const { return m_strServerKey; }
    /// The time that a call may take altogether, or a transfer without progress, in place of a minute.
    void setTotalTimeout(std::chrono::milliseconds timeout) { m_totalTimeout = timeout; }
    /// Lets somebody watch and cancel the transfer of files that is called next, and fillDetails why it
    /// failed.
    void setTransfer(std::shared_ptr<Transfer> transfer) { m_transfer = std::move(transfer); }
    /// The raw token: as set, or as the service renewed it in the last call.
    const std::string &accessToken() const { return m_strAccess; }
    /// After a call that failed: true when the service may have done it all the same, for it may have got the
    /// whole request and has not answered it with a yes or a no that can be read.
    bool isUnanswered() const { return m_unanswered; }

    // Session and server

    /// Liveness probe: needs neither token nor account, waits two seconds at most for a connection and for an
    /// answer. uOnline: 1 when the service answered with status 200, else 0.
    virtual unsigned isServerOnline(std::uint32_t &uOnline);
    /// Opens a session and hands its token to CLocalStore::setAccess. Needs no token.
    virtual unsigned loginServer(const char *szAccount, const char *szPassword);
    /// szSession: any text; only its presence is looked at.
    virtual unsigned logoutServer(const char *szSession);

    // Sites

    /// szParent: null or empty for a top-level site. strSiteId: the new site's id.
    virtual unsigned addSite(const char *szName, const char *szParent, std::string &strSiteId);
    virtual unsigned updateSite(const char *szSiteId, const char *szName, const char *szParent);
    virtual unsigned removeSite(const char *szSiteId);
    /// A page of site records; nStart counts from 0.
    virtual unsigned listSites(int nStart, int nCount, JSON &sites);
    /// szStage: "all", "start", "update" or "end".
    virtual unsigned commitSites(const JSON &sites, const char *szStage);

    // Devices

    /// A page of device records; nStart counts from 0.
    virtual unsigned listDevices(int nStart, int nCount, JSON &devices);
    /// devices: array of records. szStage: "all", "start", "update" or "end".
    virtual unsigned commitDevices(const JSON &devices, const char *szStage);
    /// The three discoveries start a scan of nTimeout seconds on the service and return at once.
    virtual unsigned deviceDiscovery(int nTimeout);
    virtual unsigned deviceDiscoverByIP(const char *szIp, int nTimeout);
    virtual unsigned deviceDiscoverByIPs(const char *szFirst, const char *szLast, int nTimeout);
    /// What the last scan has found so far, 65,536 devices at most.
    virtual unsigned discoveredDevices(JSON &devices);
    virtual unsigned setPassPolicy(const JSON &devices, const char *szType, int nMinLength,
                                   const char *szTaskId);
    virtual unsigned authDevices(const JSON &devices, const char *szAccount, const char *szPassword);
    /// A page of status records; nStart counts from 0.
    virtual unsigned listDeviceStatus(int nStart, int nCount, JSON &statuses);

    /// The same pages as the text of an array: who reads them again and again looks at what is new alone.
    unsigned listDevicesText(int nStart, int nCount, std::string &text);
    unsigned listDeviceStatusText(int nStart, int nCount, std::string &text);

    // Commands on devices

    /// A page of the stored custom commands; nStart counts from 0.
    virtual unsigned listCgis(int nStart, int nCount, JSON &cgis);
    /// cgis: array of custom commands, which take the place of the stored ones. szStage: "all", "start",
    /// "update" or "end".
    virtual unsigned commitCgis(const JSON &cgis, const char *szStage);
    /// The same as runCustomCgisEx without the devices' answers.
    virtual unsigned runCustomCgis(const JSON &cgis, const JSON &devices);
    /// Lets devices run commands. cgis: array of commands, each a path of a device. devices: array of ids, or
    /// of objects with "id" and "tid" to run under a task, which is answered at once. answers: one a device.
    virtual unsigned runCustomCgisEx(const JSON &cgis, const JSON &devices, JSON &answers);
    /// Sends the body, which names its "devices", to a path of the service.
    virtual unsigned runGeneralCgis(const char *szPath, const JSON &body);

    // Service settings

    virtual unsigned loadServerSettings(JSON &settings);
    /// Sends those members of the object that are settings of the service, nothing else.
    virtual unsigned saveServerSettings(const JSON &settings);

    // Tasks and alarms

    /// Registers a task. devices: array of ids or of objects with "id" and the task's parameters. task: its
    /// record.
    virtual unsigned newTaskState(const char *szType, const JSON &devices, JSON &task);
    /// A page of task records, newest first; nStart counts from 0.
    virtual unsigned listTaskStatus(int nStart, int nCount, JSON &tasks);
    /// Takes finished tasks off the service's list. tids: array of their ids.
    virtual unsigned removeTaskStatus(const JSON &tids);
    /// Ends a task. szState: "pTaskDone", "pTaskAborted" or "pTaskFailed".
    virtual unsigned updateTaskState(const char *szTaskId, const char *szState);
    /// A page of alarms, newest first: an object with "items", of which those beyond nCount are dropped, and
    /// "total_items".
    virtual unsigned listAlarmInfo(int nStart, int nCount, JSON &alarms);
    /// alids: array of the ids of alarms.
    virtual unsigned removeAlarmInfo(const JSON &alids);

    // Files for devices, each the work of a task that was registered before
    //
    // They are read while they are sent, so their size costs no memory. A file has to be a plain one with
    // something in it, and has to stay as it is until it is sent: ApiException otherwise. Why a transfer
    // failed is told by the Transfer, if one was set. Slow: run it outside the lock of other jobs.
    // szPath: full path. szFileName: what it is called at the service. Texts are UTF-8. devices: array of
    // ids.

    virtual unsigned uploadConfigFile(const char *szTaskId, const char *szPath, const char *szFileName,
                                      const JSON &devices);
    /// A service on this computer is given the path alone and reads the image itself.
    virtual unsigned uploadFWFile(const char *szTaskId, const char *szPath, const char *szFileName);
    /// bSdCard: whether the package goes to the device's memory card.
    virtual unsigned uploadPackage(const char *szTaskId, const char *szPath, const char *szFileName,
                                   const JSON &devices, bool bSdCard);
    /// settings: object with "mode", "https_port", "country", "state", "locality", "org", "org_unit" and
    /// "validity"; others are not sent. devices: array of objects with "id" and "tid". No file is sent.
    virtual unsigned createHttpsSelfSignedCerts(const JSON &settings, const JSON &devices);
    /// certs: array of objects with "fpath", "fname" and "d_mac", one a device.
    virtual unsigned createHttpsCertsInstall(const char *szTaskId, const JSON &certs);
    /// certs and pkeys: arrays as above, both for the same devices.
    virtual unsigned createHttpsCertsPKeys(const char *szTaskId, const JSON &certs, const JSON &pkeys);
    virtual unsigned uploadPEAPCA(const char *szTaskId, const char *szPath, const char *szFileName);
    /// szPath: of the CA certificate. certs and pkeys: as of createHttpsCertsPKeys.
    virtual unsigned uploadTLSCA(const char *szTaskId, const char *szPath, const char *szFileName,
                                 const JSON &certs, const JSON &pkeys);

    // Exports

    /// Has debug information collected. szStorePath: where, on the service's machine.
    virtual unsigned exportDebugInfo(const char *szStorePath, const JSON &devices, JSON &answer);
    /// Fetches the file (a zip) of a finished export. szTarget: the path it gets, which has to be free;
    /// nothing is there unless it is whole. ApiTargetNotWritten when it exists already or cannot be written.
    virtual unsigned exportFile(const char *szTaskId, const char *szTarget);

    // Configuration of devices

    /// Sends those members of the settings that a quick setup knows. devices: array of ids, or of objects
    /// with "id" and "tid".
    virtual unsigned runQuickSetup(const JSON &devices, const JSON &settings, JSON &answer);
    /// configuration: the device's sections, each an object of items.
    virtual unsigned runConfigQuery(const char *szDeviceId, JSON &configuration);
    /// szTemplate: the text of a template file. devices: as for runQuickSetup.
    virtual unsigned setTemplate(const JSON &devices, const char *szTemplate, JSON &answer);

    // The service's log

    /// Log entries of a time range, both ends Unix ms as decimal text and inclusive. table: array of objects
    /// whose members are named like the columns of the log page, the first 200,000; ApiException when an
    /// entry lacks a value.
    virtual unsigned browseLogs(const char *szStart, const char *szEnd, JSON &table);

    // Remote access; what is signed in to, listed and added lives with the service, not with this client

    virtual unsigned addService(const char *szOrgId, const char *szSiteId);
    /// szPassword: plain; ciphered on its way. ApiCode105: wrong e-mail or password, or no session here;
    /// ApiCode108: the password has expired; ApiServerError: unknown user.
    virtual unsigned authenticateWithOrb(const char *szEmail, const char *szPassword);
    /// organizations: array of objects with "organizationID", "organizationName", "enableRemoteAccess" and
    /// "sites", an array of objects with "id" and "name".
    virtual unsigned browseOrbOrgs(JSON &organizations);
    virtual unsigned disconnectOrbService();
    virtual unsigned getOrbServiceCachedStatus(OrbServiceStatus &status);
    virtual unsigned isOrbServiceAdded(bool &bAdded);
    /// bState: what holds from now on.
    virtual unsigned toggleRemoteAccess(bool bEnable, bool &bState);

protected:
    enum class Payload { None, Plain, Ciphered, File };

    /// What tells one request from another; the rest of the road is the same for all.
    struct Call {
        const char *method; ///< as it stands in the log lines
        const char *path;
        Payload payload = Payload::None;
        bool genericToken = false;                   ///< a fresh token of its own in place of the session's
        const char *transportError = "HTTP error: "; ///< begins the line on standard output
        void (*logTransportError)(const Call &call, const std::string &error) = nullptr;
        void (*logException)(const Call &call, const std::string &error) = nullptr;
        unsigned (*judgeCode)(int code) = nullptr; ///< in place of the usual judging of "code"
        /// Called with every answer, whatever its status, before it is judged.
        void (*logAnswer)(const Call &call, const HttpResponse &answer) = nullptr;
        const char *renewal = nullptr; ///< begins the log line of a renewed token, in place of the usual
    };

    /// Where the data of an answer go: as a value, as the text of ciphered ones, or nowhere.
    struct Output {
        Output(JSON *wanted = nullptr) : value(wanted) {}
        Output(std::string *wanted) : text(wanted) {}
        bool isEmpty() const { return !value && !text; }

        JSON *value = nullptr;
        std::string *text = nullptr;
    };

    /// Sends body to the call's path by POST and judges the answer. output: set where the call has a payload.
    unsigned post(const Call &call, const JSON &body, const Output &output = {});
    /// The same for an authenticated method: checks the preconditions and adds "id" to the body.
    unsigned postAsAccount(const Call &call, JSON body, const Output &output = {});

    /// The same for a method that lists a page of records: an answer with more than were asked for is
    /// refused with ApiException.
    unsigned postForPage(const Call &call, int nStart, int nCount, JSON &records);

    /// Drops what an array holds beyond a count.
    static void cutTo(JSON &list, int nCount);

    /// True when there is what every authenticated method needs.
    bool hasSession() const;

    /// An argument that has to be there.
    static bool isEmpty(const char *szText) { return !szText || !*szText; }
    /// The stage of a commit in several requests: "all", "start", "update" or "end".
    static bool isStage(const char *szStage);

private:
    /// Gives a request, which has what all of them have, what it has of its own.
    using Fill = std::function<void(HttpRequest &)>;

    unsigned send(const Call &call, const Fill &fill, const Output &output = {});
    unsigned exchange(const Call &call, const Fill &fill, const Output &output);
    /// With the server's key looked at.
    HttpResponse exchange(HttpRequest &request);
    /// Of a request without an answer.
    static unsigned transportResult(const HttpResponse &answer);

    /// How the uploads differ from the rest of the road.
    static Call uploadCall(const char *method, const char *path, const char *transportError = nullptr);
    static Call certificateCall(const char *method, const char *path);
    /// Sends a form: the parameters with task and account, then the files.
    unsigned upload(const Call &call, const char *szTaskId, JSON parameters,
                    const std::vector<UploadPart> &files);
    std::shared_ptr<Transfer> transferOrOwn() const;

    unsigned postAboutOrb(const char *method, const char *path, JSON body, JSON *cipheredData = nullptr);
    unsigned judge(const Call &call, const HttpResponse &answer, const Output &output);
    /// What a request without a session is authorized with; throws when none can be made.
    static std::string freshGenericToken();
    static void logException(const Call &call, const std::string &error);
    void renewToken(const Call &call, const std::string &token);

    std::string m_strHost;
    std::uint32_t m_uPort;
    std::string m_strAccess;
    std::string m_strAccount;
    std::string m_strExpectedKey;
    std::string m_strServerKey;
    std::chrono::milliseconds m_totalTimeout{60000};
    std::shared_ptr<Transfer> m_transfer;
    bool m_unanswered = false;
};
