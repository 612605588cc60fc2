#include "servicecaller.h"

#include "platform/crypto/nvlcrypto.h"

#include <httplib.h>

namespace {

template <typename Operation>
std::optional<std::string> ciphered(Operation operation) {
    char *raw = nullptr;
    if (operation(&raw) != 0 || !raw)
        return std::nullopt;
    std::string text = raw;
    nvlcryptoFree(raw);
    return text;
}

Json dataOf(const Json &body, bool &secret) {
    const auto found = body.find("data");
    if (found == body.end())
        return {};
    secret = found->is_string() && found->get_ref<const std::string &>().rfind("D1:", 0) == 0;
    if (!secret)
        return *found;
    const auto &cypher = found->get_ref<const std::string &>();
    const auto plain = ciphered([&](char **out) { return cypherToData(cypher.data(), cypher.size(), out); });
    return plain ? Json::parse(*plain, nullptr, false) : Json();
}

} // namespace

std::string ServiceCaller::genericToken() {
    return ciphered(&createGenericToken).value_or(std::string());
}

std::string ServiceCaller::cipheredPassword(const std::string &password) {
    return ciphered([&](char **out) { return passToCipher(password.data(), password.size(), out); })
        .value_or(std::string());
}

Reply ServiceCaller::send(const Request &request) const {
    httplib::Request raw;
    raw.method = request.verb;
    raw.path = request.path;
    raw.body = request.body;
    raw.headers = {{"Authorization", request.token}, {"Content-Type", request.contentType}};
    return send(std::move(raw));
}

Reply ServiceCaller::sendForm(const std::string &path, Json parameters,
                              const std::vector<File> &files) const {
    const std::string boundary = "a-line-that-no-file-holds";
    parameters["id"] = m_account;
    httplib::Request raw;
    raw.method = "POST";
    raw.path = path;
    const auto add = [&](const std::string &name, const std::string &fileName, const std::string &content) {
        raw.body += "--" + boundary + "\r\nContent-Disposition: form-data; name=\"" + name +
                    "\"; filename=\"" + fileName + "\"\r\n\r\n" + content + "\r\n";
    };
    add("text", "data", parameters.dump());
    for (const File &file : files)
        add(file.part, file.name, file.content);
    raw.body += "--" + boundary + "--\r\n";
    raw.headers = {{"Authorization", m_token}, {"Content-Type", "multipart/form-data; boundary=" + boundary}};
    return send(std::move(raw));
}

Reply ServiceCaller::send(httplib::Request raw) const {
    httplib::SSLClient client("127.0.0.1", m_port);
    client.enable_server_certificate_verification(false);
    client.set_read_timeout(m_readTimeout);
    // The library sends head and body apart; without this each request waits for a delayed acknowledgement.
    client.set_tcp_nodelay(true);
    const httplib::Result result = client.send(raw);
    Reply reply;
    if (!result) {
        reply.error = httplib::to_string(result.error());
        return reply;
    }
    reply.status = result->status;
    reply.token = result->get_header_value("Authorization");
    reply.contentType = result->get_header_value("Content-Type");
    reply.bytes = result->body;
    reply.body = Json::parse(result->body, nullptr, false);
    if (reply.body.is_object()) {
        const Json code = reply.body.value("code", Json());
        reply.code = code.is_number_integer() ? code.get<int>() : -1;
        reply.data = dataOf(reply.body, reply.secret);
    }
    return reply;
}

Reply ServiceCaller::post(const std::string &path, const Json &body) const {
    Request request;
    request.path = path;
    request.body = body.dump();
    request.token = genericToken();
    return send(request);
}

Reply ServiceCaller::login(const std::string &email, const std::string &password) {
    const Reply reply = post("/v1/login", {{"email", email}, {"pass", cipheredPassword(password)}});
    if (reply.code == 0) {
        m_account = email;
        m_token = reply.token;
    }
    return reply;
}

Reply ServiceCaller::call(const std::string &path, Json body) {
    if (!body.contains("id"))
        body["id"] = m_account;
    Request request;
    request.path = path;
    request.body = body.dump();
    request.token = m_token;
    const Reply reply = send(request);
    if (reply.code == 0 && !reply.token.empty())
        m_token = reply.token;
    return reply;
}

Json ServiceCaller::list(const std::string &path, int pageSize) {
    Json all = Json::array();
    for (std::size_t got = 1; got != 0;) {
        const Reply page = call(path, {{"start", all.size()}, {"count", pageSize}});
        got = page.data.is_array() ? page.data.size() : 0;
        for (std::size_t i = 0; i < got; ++i)
            all.push_back(page.data[i]);
    }
    return all;
}
