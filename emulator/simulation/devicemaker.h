#pragma once

#include "http/jsonaccess.h"
#include "tables/records.h"

#include <cstdint>
#include <string>

namespace emulator {

/// What a device on the network shows without authorization: model, address, MAC and ports.
struct Appearance {
    std::string model;
    std::string ip;
    std::string mac;
    int http = 80;
    int https = 443;
};

/// The n-th device of a seed: the same on every machine and at every time.
Appearance appearanceOf(std::uint64_t seed, std::uint64_t n);

/// The address with a number within 10.0.0.0/8, without network and broadcast addresses.
std::string addressOf(std::uint32_t number);

/// Adds what a service learns from a device that lets it in, where the record does not have it yet.
void fillDetails(Json &record, const std::string &hostName);

/// "Camera", "NVR" or "Encoder", by the model.
std::string classOf(const std::string &model);

/// The record that a service has of a device that has not let it in.
Json firstRecord(const Appearance &appearance);

/// A device with some members of its record changed; null takes one out.
Device withMembers(const Device &device, const Json &members);

/// Splits a record into the columns that are stored: the id, the MAC address, the IP address and the whole
/// text.
void setRecord(Device &device, Json record);

} // namespace emulator
