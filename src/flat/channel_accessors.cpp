#include "flat/accessors.h"
#include "flat/lists.h"

using namespace raid::flat;

int getChannelCount() { return count(ChannelList); }

int getChannelAdapterID(int position) {
    return number<&RAIDChannel::getAdapterID>(ChannelList, position);
}
int getChannelTransferSpeed(int position) {
    return number<&RAIDChannel::getTransferSpeed>(ChannelList, position);
}
int getChannelType(int position) { return number<&RAIDChannel::getType>(ChannelList, position); }
int getChannelChannelID(int position) {
    return number<&RAIDChannel::getChannelID>(ChannelList, position);
}
int getChannelInitiatorID(int position) {
    return number<&RAIDChannel::getInitiatorID>(ChannelList, position);
}

int getChannelAdapterIDString(char* destination, int position) {
    return displayName<"Controller %d", &RAIDChannel::getAdapterID>(destination, ChannelList,
                                                                    position);
}
int getChannelChannelIDString(char* destination, int position) {
    return displayName<"SCSI Channel %d", &RAIDChannel::getChannelID>(destination, ChannelList,
                                                                      position);
}
