#pragma once

#include <cstddef>
#include <cstdint>
#include <exception>
#include <vector>

class ResponseHeaderGuard;
class MultipartBody;
class RequestDeadline;
class Transfer;

namespace httplib {
class DataSink;
struct Request;
} // namespace httplib

/// Sends a form as the body of a request, a block at a time: what was sent is progress for the deadline and
/// for whoever watches the transfer. Lives as long as the request.
class MultipartStreamer {
public:
    MultipartStreamer(MultipartBody &form, Transfer &transfer, RequestDeadline &deadline,
                      const ResponseHeaderGuard &head);

    void attach(httplib::Request &message);

    /// Throws what ended the sending here, in place of the transport, which exceptions must not cross.
    void rethrow() const;
    /// The status of a service that did not wait for the end of the form; 0 for one that did.
    int refusal() const { return m_refusal; }

private:
    bool send(std::uint64_t offset, std::size_t length, httplib::DataSink &sink);
    bool sendBlock(std::uint64_t offset, std::size_t length, httplib::DataSink &sink);

    MultipartBody &m_form;
    Transfer &m_transfer;
    RequestDeadline &m_deadline;
    const ResponseHeaderGuard &m_head;
    std::vector<char> m_block;
    std::exception_ptr m_error;
    int m_refusal = 0;
};
