#include "flat/accessors.h"
#include "flat/lists.h"

namespace {

using Channel = RAIDChannel;
constexpr raid::flat::Family channels(ChannelList);

}  // namespace

int getChannelCount() { return channels.count(); }

int getChannelAdapterID(int at) { return channels.number<&Channel::getAdapterID>(at); }
int getChannelTransferSpeed(int at) { return channels.number<&Channel::getTransferSpeed>(at); }
int getChannelType(int at) { return channels.number<&Channel::getType>(at); }
int getChannelChannelID(int at) { return channels.number<&Channel::getChannelID>(at); }
int getChannelInitiatorID(int at) { return channels.number<&Channel::getInitiatorID>(at); }

int getChannelAdapterIDString(char* to, int at) {
    return channels.displayName<"Controller %d", &Channel::getAdapterID>(to, at);
}
int getChannelChannelIDString(char* to, int at) {
    return channels.displayName<"SCSI Channel %d", &Channel::getChannelID>(to, at);
}
