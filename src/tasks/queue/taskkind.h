#pragma once

#include "platform/json.h"

#include <memory>

class ServiceSession;
class Transfer;

/// One record's turn at work, as its family's functions see it. On a runner's thread.
struct TaskContext {
    ServiceSession &session;
    const JSON &record;
    std::shared_ptr<Transfer> transfer; ///< to be given to a call that sends files
    std::string tid = {};               ///< the service task's id; empty before it is made
    bool hasBegun = true;               ///< false when the work ended before its own request was made

    /// The text of a member of the record; empty where there is none.
    std::string text(const char *member) const { return std::string(textMember(record, member)); }
};

/// What tells the records of one type from those of another: one row of a queue's table.
struct TaskKind {
    const char *type;               ///< of the records
    const char *serviceType;        ///< of the tasks made on the service
    const char *idPrefix;           ///< of the records' ids
    const char *targets;            ///< the member that holds the devices
    bool isUpload = false;          ///< sends a file; else it applies something
    bool asksAgain = false;         ///< holds a password or a key, which a repetition has to ask for
    const char *fileName = nullptr; ///< the member with the name of the one file that is sent

    struct Lines {
        const char *failure; ///< "%d" stands for the result
        const char *success; ///< null where none is logged
        const char *exception;
        const char *update; ///< when the state of a record cannot be written
    } lines;

    /// The devices, with the parameters that travel on them, as newTaskState takes them.
    JSON (*devices)(const JSON &record);
    /// Logs what is about to be done.
    void (*announce)(const TaskContext &step);
    /// Does the work under the service task and returns its result.
    unsigned (*work)(TaskContext &step);

    const char *workingState() const { return isUpload ? "uploading" : "applying"; }
    const char *successState() const { return isUpload ? "upload_done" : "apply_done"; }
    const char *failureState() const { return isUpload ? "upload_fail" : "apply_fail"; }
};
