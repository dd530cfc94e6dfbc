/* RAIDInstrumentation.h - the flat interface of libRAIDInstrumentation, for C99 and C++.
 *
 * The library asks the RAID management service of this machine (127.0.0.1, TCP port 34572) for the
 * RAID configuration and the controller events, and publishes both as lists of records which the
 * functions below read by position. Link it, or load it with dlopen() and look the names up.
 *
 * Conventions
 *
 *  1. Positions. A record is addressed by its zero-based position, an int, in the list of its kind;
 *     valid positions run from 0 to the kind's count minus one. A position outside the list reads
 *     nothing: number functions return 0, text and display-name functions write an empty string
 *     (display-name functions return 0), status-text functions leave the buffer as it was, and
 *     initiator IDs are empty. Positions follow the order of the configuration: adapter by adapter;
 *     in it channel by channel (drives, enclosures and their parts), then logical drives, then
 *     arrays.
 *
 *  2. Shapes. There are five, and every function below has one of them:
 *       count         int  getXCount(void)                 number of records
 *       number        int  getXField(int position)         a number as the service sent it
 *       text          void getXField(char*, int position)  writes a string
 *       display name  int  getXFieldString(char*, int)     writes a string, returns its length
 *       status text   void getXOverallStatusString(...)    writes "Normal" (0), "Warning" (1) or
 *                                                          "Critical" (2)
 *     Numbers are signed and have 32 bits; a value that the service did not send is 0 unless a
 *     comment says otherwise. A flag is 1 only if the service sent exactly "true", otherwise 0.
 *     Codes (state, type, RAID level, cache mode, part status) and units of sizes are the service's
 *     own and are passed on unchanged.
 *
 *  3. Buffers. `destination` belongs to the caller. Texts are written with their terminating zero
 *     byte and WITHOUT ANY LENGTH LIMIT: the service decides how long a text is, and no text is
 *     longer than the answer it came in (an answer has fewer than 10^9 bytes). A display name needs
 *     at most 32 bytes, a status text 9. Give status-text functions an initialised buffer: a status
 *     other than 0, 1 and 2 leaves it untouched. Texts are the service's bytes: entity references
 *     such as "&amp;" are not decoded, and the bytes need not be valid UTF-8.
 *
 *  4. Ownership. Nothing is handed out by pointer; every function copies into the caller's buffer
 *     or returns an int. The lists belong to the library, stay as they are until the next rebuild,
 *     and go away when it is unloaded.
 *
 *  5. Threads. The library starts none. It is made for two callers: an inventory thread, which
 *     calls RAIDinit and the counts and accessors of the inventory one at a time, and an event
 *     thread, which calls getEvent and reads the events between its calls. The lists have no lock.
 *     setRefreshFlag belongs to the inventory thread; cancelGetEvent may be called from any thread.
 *     A pthread_cancel of a thread that waits in the library takes effect when the wait has ended:
 *     cancelGetEvent comes first.
 *
 *  6. Refresh. Call RAIDinit once. Afterwards all accessors answer from the lists read then. After
 *     setRefreshFlag the next inventory count of any kind asks the service again and rebuilds all
 *     twelve inventory lists, so read every count anew. Events never rebuild the inventory.
 *
 *  7. Errors. Nothing reports an error except enableRAIDEvent. If the service cannot be reached or
 *     its answer is malformed, the inventory lists keep what they held (nothing, at first). The
 *     exported pointer `raidSystem` (C++, the configuration read last) tells more: it is null when
 *     the last answer was malformed, and what it was before when no answer came. A service that
 *     stays silent, be it that it accepts no connection, blocks the caller until cancelGetEvent is
 *     called on another thread. Functions are C++ inside: an exception such as std::bad_alloc may
 *     leave the count functions, RAIDinit, enableRAIDEvent and getEvent.
 *
 *  8. Events. Call enableRAIDEvent (start at the newest event) or setRAIDEventSequenceNumber
 *     (resume), then again and again getEvent, getRAIDEventCount and the event accessors.
 *     Five pitfalls:
 *       - A cancelled or failed getEvent publishes the previous batch once more and advances the
 *         next number by its size. After each batch call setRAIDEventSequenceNumber with the last
 *         sequence number seen plus one, and pass over events whose number was seen before.
 *       - After a malformed answer getEvent leaves the list empty and the number as it was.
 *       - Every exchange that starts clears `endFlag`, also one of the inventory thread. A cancel
 *         can be lost to it, so repeat cancelGetEvent until getEvent has returned.
 *       - A cancel ends every exchange that is waiting, also one of the inventory thread, whose
 *         lists then keep what they held.
 *       - The wait notices a cancel after its current slice of at most 5 seconds; a signal whose
 *         handler does nothing, sent to the event thread, ends the slice at once.
 *
 *  9. Output. Every exchange prints one line, "sent size ..., FD isset ...", on standard output.
 *     Errors and traces go to "../logs/RAIDInstrumentation.log" at the "LogLevel" that is set in
 *     "../logs/RAIDInstrumentation.ini"; both paths are relative to the working directory.
 *
 * In the comments `as:...` and `ac:...` name the element of the service's document that the value
 * comes from. "sic" marks a name or a pairing that looks wrong and is meant.
 */
#ifndef RAIDINSTRUMENTATION_H
#define RAIDINSTRUMENTATION_H

#include <pthread.h>

#ifdef __cplusplus
extern "C" {
#endif

#pragma GCC visibility push(default)

/* ----------------------------------------------------------------------------
 * Life cycle and refresh
 */

/** Asks the service for the configuration and fills the inventory lists. Call it once, before
 *  anything else. Always returns 0. */
int RAIDinit(void);

/** Makes the next inventory count rebuild the lists. Asks nothing itself. */
void setRefreshFlag(void);

/** Returns its argument. */
int getPellionIndex(int position);

/* ----------------------------------------------------------------------------
 * Pellion adapters: the adapters of type "o:PellionAdapter" and "o:MirrelAdapter".
 * Adapters of a type in none of the three families are not published; what belongs to them is.
 */

/** Number of Pellion adapters; rebuilds the lists if a refresh is due. */
int getPellionAdapterCount(void);

/** `as:adapterID` of `ac:adapter`. */
int getPellionAdapterAdapterID(int position);

/** `as:physicalSlot` of `ac:adapter`. */
int getPellionAdapterPhysicalSlot(int position);

/** Flag `as:clustering` of `ac:adapter`. */
int getPellionAdapterClustering(int position);

/** `as:batteryStatus` of `ac:adapter`; a code of the service. */
int getPellionAdapterBatteryStatus(int position);

/** Flag `as:hotSwapRebuild` of `ac:adapter`. */
int getPellionAdapterHotSwapRebuild(int position);

/** `as:stripeUnitSize` of `ac:adapter`; in the service's unit. */
int getPellionAdapterStripeUnitSize(int position);

/** Flag `as:dataScrubbing` of `ac:adapter`. */
int getPellionAdapterDataScrubbing(int position);

/** Flag `as:autoSynchronization` of `ac:adapter`. */
int getPellionAdapterAutoSynchronization(int position);

/** Flag `as:unattended` of `ac:adapter`. */
int getPellionAdapterUnattended(int position);

/** Flag `as:limitedBIOSCompatibility` of `ac:adapter`. */
int getPellionAdapterLimitedBIOSCompatibility(int position);

/** Always 0; takes no position and reads no list (sic). */
int getPellionAdapterCacheReadPolicy(void);

/** `as:driverVersion` of `ac:adapter`. */
void getPellionAdapterDriverVersion(char* destination, int position);

/** `as:batteryFruNumber` of `ac:adapter`. */
void getPellionAdapterBatteryFruNumber(char* destination, int position);

/** `as:fruNumber` of `ac:adapter`. */
void getPellionAdapterFruNumber(char* destination, int position);

/** `as:partNumber` of `ac:adapter`. */
void getPellionAdapterPartNumber(char* destination, int position);

/** `as:serialNumber` of `ac:adapter`. */
void getPellionAdapterSerialNumber(char* destination, int position);

/** `as:typeName` of `ac:adapter`. */
void getPellionAdapterTypeName(char* destination, int position);

/** `as:firmwareVersion` of `ac:adapter`. */
void getPellionAdapterFirmwareVersion(char* destination, int position);

/** `as:biosVersion` of `ac:adapter`. */
void getPellionAdapterBiosVersion(char* destination, int position);

/** Status text of `as:overallStatus` of `ac:adapter`. */
void getPellionAdapterOverallStatusString(char* destination, int position);

/** "Pellion Adapter %d" with the adapter ID. */
int getPellionAdapterAdapterIDString(char* destination, int position);

/** The decimal `as:initiatorID` of each channel of the adapter in order, separated by commas; empty
 *  without channels. Needs up to 12 bytes for each channel. */
void getPellionAdapterInitiatorIDs(char* destination, int position);

/* ----------------------------------------------------------------------------
 * LSI adapters: the adapters of type "o:LSIAdapter".
 */

/** Number of LSI adapters; rebuilds the lists if a refresh is due. */
int getLSIAdapterCount(void);

/** `as:adapterID` of `ac:adapter`. */
int getLSIAdapterAdapterID(int position);

/** `as:physicalSlot` of `ac:adapter`. */
int getLSIAdapterPhysicalSlot(int position);

/** Flag `as:clustering` of `ac:adapter`. */
int getLSIAdapterClustering(int position);

/** `as:batteryStatus` of `ac:adapter`; a code of the service. */
int getLSIAdapterBatteryStatus(int position);

/** Flag `as:hotSwapRebuild` of `ac:adapter`. */
int getLSIAdapterHotSwapRebuild(int position);

/** `as:driverVersion` of `ac:adapter`. */
void getLSIAdapterDriverVersion(char* destination, int position);

/** `as:batteryFruNumber` of `ac:adapter`. */
void getLSIAdapterBatteryFruNumber(char* destination, int position);

/** `as:fruNumber` of `ac:adapter`. */
void getLSIAdapterFruNumber(char* destination, int position);

/** `as:partNumber` of `ac:adapter`. */
void getLSIAdapterPartNumber(char* destination, int position);

/** `as:serialNumber` of `ac:adapter`. */
void getLSIAdapterSerialNumber(char* destination, int position);

/** `as:typeName` of `ac:adapter`. */
void getLSIAdapterTypeName(char* destination, int position);

/** `as:firmwareVersion` of `ac:adapter`. */
void getLSIAdapterFirmwareVersion(char* destination, int position);

/** `as:biosVersion` of `ac:adapter`. */
void getLSIAdapterBiosVersion(char* destination, int position);

/** Status text of `as:overallStatus` of `ac:adapter`. */
void getLSIAdapterOverallStatusString(char* destination, int position);

/** "LSI Adapter %d" with the adapter ID. */
int getLSIAdapterAdapterIDString(char* destination, int position);

/** The decimal `as:initiatorID` of each channel of the adapter in order, separated by commas; empty
 *  without channels. Needs up to 12 bytes for each channel. */
void getLSIAdapterInitiatorIDs(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Vantry adapters: the adapters of type "o:DorvelAdapter".
 */

/** Number of Vantry adapters; rebuilds the lists if a refresh is due. */
int getVantryAdapterCount(void);

/** `as:adapterID` of `ac:adapter`. */
int getVantryAdapterAdapterID(int position);

/** `as:physicalSlot` of `ac:adapter`. */
int getVantryAdapterPhysicalSlot(int position);

/** Flag `as:clustering` of `ac:adapter`. */
int getVantryAdapterClustering(int position);

/** `as:batteryStatus` of `ac:adapter`; a code of the service. */
int getVantryAdapterBatteryStatus(int position);

/** `as:driverVersion` of `ac:adapter`. */
void getVantryAdapterDriverVersion(char* destination, int position);

/** `as:batteryFruNumber` of `ac:adapter`. */
void getVantryAdapterBatteryFruNumber(char* destination, int position);

/** `as:fruNumber` of `ac:adapter`. */
void getVantryAdapterFruNumber(char* destination, int position);

/** `as:partNumber` of `ac:adapter`. */
void getVantryAdapterPartNumber(char* destination, int position);

/** `as:serialNumber` of `ac:adapter`. */
void getVantryAdapterSerialNumber(char* destination, int position);

/** `as:typeName` of `ac:adapter`. */
void getVantryAdapterTypeName(char* destination, int position);

/** `as:firmwareVersion` of `ac:adapter`. */
void getVantryAdapterFirmwareVersion(char* destination, int position);

/** `as:biosVersion` of `ac:adapter`. */
void getVantryAdapterBiosVersion(char* destination, int position);

/** Status text of `as:overallStatus` of `ac:adapter`. */
void getVantryAdapterOverallStatusString(char* destination, int position);

/** "Vantry Adapter %d" with the adapter ID. */
int getVantryAdapterAdapterIDString(char* destination, int position);

/** The decimal `as:initiatorID` of each channel of the adapter in order, separated by commas; empty
 *  without channels. Needs up to 12 bytes for each channel. */
void getVantryAdapterInitiatorIDs(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Channels: every channel of every adapter.
 */

/** Number of channels; rebuilds the lists if a refresh is due. */
int getChannelCount(void);

/** `as:adapterID` of `ac:channel`. */
int getChannelAdapterID(int position);

/** `as:transferSpeed` of `ac:channel`; in the service's unit. */
int getChannelTransferSpeed(int position);

/** `as:type` of `ac:channel`; a code of the service. */
int getChannelType(int position);

/** `as:channelID` of `ac:channel`. */
int getChannelChannelID(int position);

/** `as:initiatorID` of `ac:channel`. */
int getChannelInitiatorID(int position);

/** "Controller %d" with the adapter ID. */
int getChannelAdapterIDString(char* destination, int position);

/** "SCSI Channel %d" with the channel ID. */
int getChannelChannelIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Basic arrays: for each adapter its own basic arrays, then those inside its spanned arrays, in
 * the order of the spanned arrays.
 */

/** Number of basic arrays; rebuilds the lists if a refresh is due. */
int getArrayCount(void);

/** `as:adapterID` of `ac:basicArray`. */
int getArrayAdapterID(int position);

/** Always -1, also for a basic array inside a spanned array (sic). */
int getArraySpannedArrayIndex(int position);

/** `as:size` of `ac:basicArray`; in the service's unit. */
int getArraySize(int position);

/** `as:freeSpace` of `ac:basicArray`; in the service's unit. */
int getArrayFreeSpace(int position);

/** `as:type` of `ac:basicArray`; a code of the service. */
int getArrayType(int position);

/** `as:arrayID` of `ac:basicArray`. */
int getArrayArrayID(int position);

/** `as:stripeSize` of `ac:basicArray`; in the service's unit. */
int getArrayStripeSize(int position);

/** "RAID Adapter %d" with the adapter ID. */
int getArrayAdapterIDString(char* destination, int position);

/** "RAID Array %d" with the array ID. */
int getArrayArrayIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Spanned arrays: every spanned array of every adapter.
 */

/** Number of spanned arrays; rebuilds the lists if a refresh is due. */
int getSpannedArrayCount(void);

/** `as:adapterID` of `ac:spannedArray`. */
int getSpannedArrayAdapterID(int position);

/** Always -1 (sic). */
int getSpannedArraySpannedArrayIndex(int position);

/** `as:size` of `ac:spannedArray`; in the service's unit. */
int getSpannedArraySize(int position);

/** `as:freeSpace` of `ac:spannedArray`; in the service's unit. */
int getSpannedArrayFreeSpace(int position);

/** `as:type` of `ac:spannedArray`; a code of the service. */
int getSpannedArrayType(int position);

/** `as:arrayID` of `ac:spannedArray`. */
int getSpannedArrayArrayID(int position);

/** `as:stripeSize` of `ac:spannedArray`; in the service's unit. */
int getSpannedArrayStripeSize(int position);

/** "RAID Adapter %d" with the adapter ID. */
int getSpannedArrayAdapterIDString(char* destination, int position);

/** "RAID Array %d" with the array ID. */
int getSpannedArrayArrayIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Logical drives: every logical drive of every adapter.
 */

/** Number of logical drives; rebuilds the lists if a refresh is due. */
int getRAIDLogicalDriveCount(void);

/** `as:state` of `ac:logicalDrive`; a code of the service. */
int getRAIDLogicalDriveState(int position);

/** Flag `as:shared` of `ac:logicalDrive`. */
int getRAIDLogicalDriveShared(int position);

/** `as:paritySpace` of `ac:logicalDrive`; in the service's unit. */
int getRAIDLogicalDriveParitySpace(int position);

/** `as:dataSpace` of `ac:logicalDrive`; in the service's unit. */
int getRAIDLogicalDriveDataSpace(int position);

/** `as:arrayID` of the last basic array of the adapter that lists the logical drive by its ID; -1
 *  if none does, or if the adapter is an LSI or Vantry adapter. */
int getRAIDLogicalDriveArrayID(int position);

/** `as:adapterID` of `ac:logicalDrive`. */
int getRAIDLogicalDriveAdapterID(int position);

/** `as:logicalDriveID` of `ac:logicalDrive`. */
int getRAIDLogicalDriveLogicalDriveID(int position);

/** `as:raidLevel` of `ac:logicalDrive`; a code of the service. */
int getRAIDLogicalDriveRaidLevel(int position);

/** `as:writeCacheMode` of `ac:logicalDrive`; a code of the service. */
int getRAIDLogicalDriveWriteCacheMode(int position);

/** Flag `as:blocked` of `ac:logicalDrive`. */
int getRAIDLogicalDriveBlocked(int position);

/** `as:stripeUnitSize` of `ac:logicalDrive`; in the service's unit. */
int getRAIDLogicalDriveStripeUnitSize(int position);

/** `as:type` of `ac:logicalDrive`; a code of the service. */
int getRAIDLogicalDriveType(int position);

/** Status text of `as:overallStatus` of `ac:logicalDrive`. */
void getRAIDLogicalDriveOverallStatusString(char* destination, int position);

/** "Logical Drive %d" with the array ID (sic). */
int getRAIDLogicalDriveArrayIDString(char* destination, int position);

/** "Logical Drive %d" with the adapter ID (sic). */
int getRAIDLogicalDriveAdapterIDString(char* destination, int position);

/** "Logical Drive %d" with the logical drive ID. */
int getRAIDLogicalDriveLogicalDriveIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Disk drives: every hard drive of every channel.
 */

/** Number of disk drives; rebuilds the lists if a refresh is due. */
int getRAIDDiskDriveCount(void);

/** `as:channelID` of `ac:hardDrive`. */
int getRAIDDiskDriveChannelID(int position);

/** `as:adapterID` of `ac:hardDrive`. */
int getRAIDDiskDriveAdapterID(int position);

/** `as:arrayID` of the last basic array of the adapter that lists the drive by channel and device;
 *  0 if none does, or if the adapter is an LSI or Vantry adapter. */
int getRAIDDiskDriveArrayID(int position);

/** `as:arrayUniqueID` of `ac:hardDrive`. */
int getRAIDDiskDriveArrayUniqueID(int position);

/** Flag `as:hasOSPartition` of `ac:hardDrive`. */
int getRAIDDiskDriveHasOSPartition(int position);

/** `as:size` of `ac:hardDrive`; in the service's unit. */
int getRAIDDiskDriveSize(int position);

/** `as:writeCacheEnable` of `ac:hardDrive`; a number, not a flag: the text "true" reads as 0. */
int getRAIDDiskDriveWriteCacheEnable(int position);

/** Flag `as:writeCacheEnableSupported` of `ac:hardDrive` (the name is spelled so, sic). */
int getRAIDDiskDriveWriteCachEnableSupported(int position);

/** `as:state` of `ac:hardDrive`; a code of the service. */
int getRAIDDiskDriveState(int position);

/** Flag `as:smartError` of `ac:hardDrive`. */
int getRAIDDiskDriveSmartError(int position);

/** `as:type` of `ac:hardDrive`; a code of the service. */
int getRAIDDiskDriveType(int position);

/** `as:serialNumber` of `ac:hardDrive`. */
void getRAIDDiskDriveSerialNumber(char* destination, int position);

/** `as:model` of `ac:hardDrive`. */
void getRAIDDiskDriveModel(char* destination, int position);

/** `as:fruNumber` of `ac:hardDrive`. */
void getRAIDDiskDriveFruNumber(char* destination, int position);

/** `as:vendor` of `ac:hardDrive`. */
void getRAIDDiskDriveVendor(char* destination, int position);

/** `as:firmwareLevel` of `ac:hardDrive`. */
void getRAIDDiskDriveFirmwareLevel(char* destination, int position);

/** Status text of `as:overallStatus` of `ac:hardDrive`. */
void getRAIDDiskDriveOverallStatusString(char* destination, int position);

/** "Disk Drive %d" with the array unique ID (sic). */
int getRAIDDiskDriveDiskDriveIDString(char* destination, int position);

/** "Channel %d" with the channel ID. */
int getRAIDDiskDriveChannelIDString(char* destination, int position);

/** "Controller %d" with the adapter ID. */
int getRAIDDiskDriveAdapterIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Enclosure devices: every enclosure of every channel.
 */

/** Number of enclosure devices; rebuilds the lists if a refresh is due. */
int getRAIDEnclosureDeviceCount(void);

/** `as:state` of `ac:enclosure`; a code of the service. */
int getRAIDEnclosureDeviceState(int position);

/** `as:arrayID` of `ac:enclosure`. */
int getRAIDEnclosureDeviceArrayID(int position);

/** `as:deviceID` of `ac:enclosure`. */
int getRAIDEnclosureDeviceDeviceID(int position);

/** `as:type` of `ac:enclosure`; a code of the service. */
int getRAIDEnclosureDeviceType(int position);

/** `as:channelID` of `ac:enclosure`. */
int getRAIDEnclosureDeviceChannelID(int position);

/** `as:logicalID` of `ac:enclosure`. */
int getRAIDEnclosureDeviceLogicalID(int position);

/** `as:adapterID` of `ac:enclosure`. */
int getRAIDEnclosureDeviceAdapterID(int position);

/** `as:serialNumber` of `ac:enclosure`. */
void getRAIDEnclosureDeviceSerialNumber(char* destination, int position);

/** `as:model` of `ac:enclosure`. */
void getRAIDEnclosureDeviceModel(char* destination, int position);

/** `as:fruNumber` of `ac:enclosure`. */
void getRAIDEnclosureDeviceFruNumber(char* destination, int position);

/** `as:vendor` of `ac:enclosure`. */
void getRAIDEnclosureDeviceVendor(char* destination, int position);

/** `as:firmwareLevel` of `ac:enclosure`. */
void getRAIDEnclosureDeviceFirmwareLevel(char* destination, int position);

/** The attribute `xsi:type` of `ac:enclosure`. */
void getRAIDEnclosureDeviceEnclosureDeviceType(char* destination, int position);

/** Status text of `as:overallStatus` of `ac:enclosure`. */
void getRAIDEnclosureDeviceOverallStatusString(char* destination, int position);

/** "Disk Drive %d" with the device ID (sic). */
int getRAIDEnclosureDeviceEnclosureDeviceIDString(char* destination, int position);

/** "Channel %d" with the channel ID. */
int getRAIDEnclosureDeviceChannelIDString(char* destination, int position);

/** "Controller %d" with the adapter ID. */
int getRAIDEnclosureDeviceAdapterIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Fans: every fan of every enclosure.
 * No element of a part names its parents, so its three IDs are 0.
 */

/** Number of fans; rebuilds the lists if a refresh is due. */
int getRAIDFanCount(void);

/** `as:status` of `ac:fan`; a code of the service. */
int getRAIDFanStatus(int position);

/** Always 0, see above (meant for the device ID of the enclosure). */
int getRAIDFanEnclosureID(int position);

/** Always 0, see above. */
int getRAIDFanChannelID(int position);

/** Always 0, see above. */
int getRAIDFanAdapterID(int position);

/** "Disk Drive %d" with the status number (sic). */
int getRAIDFanStatusString(char* destination, int position);

/** "Disk Drive %d" with the enclosure ID (sic). */
int getRAIDFanFanIDString(char* destination, int position);

/** "Channel %d" with the channel ID. */
int getRAIDFanChannelIDString(char* destination, int position);

/** "Controller %d" with the adapter ID. */
int getRAIDFanAdapterIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Power supplies: every power supply of every enclosure.
 * No element of a part names its parents, so its three IDs are 0.
 */

/** Number of power supplies; rebuilds the lists if a refresh is due. */
int getRAIDPowerSupplyCount(void);

/** `as:status` of `ac:powerSupply`; a code of the service. */
int getRAIDPowerSupplyStatus(int position);

/** Always 0, see above (meant for the device ID of the enclosure). */
int getRAIDPowerSupplyEnclosureID(int position);

/** Always 0, see above. */
int getRAIDPowerSupplyChannelID(int position);

/** Always 0, see above. */
int getRAIDPowerSupplyAdapterID(int position);

/** "Disk Drive %d" with the status number (sic). */
int getRAIDPowerSupplyStatusString(char* destination, int position);

/** "Disk Drive %d" with the enclosure ID (sic). */
int getRAIDPowerSupplyPowerSupplyIDString(char* destination, int position);

/** "Channel %d" with the channel ID. */
int getRAIDPowerSupplyChannelIDString(char* destination, int position);

/** "Controller %d" with the adapter ID. */
int getRAIDPowerSupplyAdapterIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Temperature sensors: every temperature sensor of every enclosure.
 * No element of a part names its parents, so its three IDs are 0.
 */

/** Number of temperature sensors; rebuilds the lists if a refresh is due. */
int getRAIDTempSensorCount(void);

/** `as:status` of `ac:tempSensor`; a code of the service. */
int getRAIDTempSensorStatus(int position);

/** Always 0, see above (meant for the device ID of the enclosure). */
int getRAIDTempSensorEnclosureID(int position);

/** Always 0, see above. */
int getRAIDTempSensorChannelID(int position);

/** Always 0, see above. */
int getRAIDTempSensorAdapterID(int position);

/** "Disk Drive %d" with the status number (sic). */
int getRAIDTempSensorStatusString(char* destination, int position);

/** "Disk Drive %d" with the enclosure ID (sic). */
int getRAIDTempSensorTempSensorIDString(char* destination, int position);

/** "Channel %d" with the channel ID. */
int getRAIDTempSensorChannelIDString(char* destination, int position);

/** "Controller %d" with the adapter ID. */
int getRAIDTempSensorAdapterIDString(char* destination, int position);

/* ----------------------------------------------------------------------------
 * The event stream (convention 8)
 */

/** Starts the stream at the newest event that the service has. Returns 1, or 0 if the service could
 *  not be asked; the next number is then -1. */
int enableRAIDEvent(void);

/** Sets the number from which the next getEvent reads. */
void setRAIDEventSequenceNumber(int sequenceNumber);

/** Blocks until the service has events from the next number on or the wait is cancelled, then
 *  publishes up to 101 of them in place of the previous ones and advances the next number by their
 *  count. Always returns 0. */
int getEvent(void);

/** Ends a getEvent that waits on another thread within 5 seconds. Repeat it until getEvent has
 *  returned. */
void cancelGetEvent(void);

/** Number of events published by the last getEvent. Never asks the service. */
int getRAIDEventCount(void);

/** `as:sequenceNumber` of `ac:event`. */
int getRAIDEventSequenceNumber(int position);

/** `as:eventCode` of `ac:event`; a code of the service. */
int getRAIDEventEventCode(int position);

/** `as:adapter` of `ac:event`, the adapter ID. */
int getRAIDEventAdapter(int position);

/** `as:logicalDrive` of `ac:event`, the logical drive ID. */
int getRAIDEventLogicalDrive(int position);

/** `as:channel` of `ac:event`, the channel ID. */
int getRAIDEventChannel(int position);

/** `as:deviceID` of `ac:event`. */
int getRAIDEventDeviceID(int position);

/** `as:enclosureID` of `ac:event`. */
int getRAIDEventEnclosureID(int position);

/** `as:type` of `ac:event`, the kind of event as text. */
void getRAIDEventType(char* destination, int position);

/** `as:string` of `ac:event`. */
void getRAIDEventMessageString(char* destination, int position);

/** `as:date` of `ac:event`, as sent. */
void getRAIDEventDate(char* destination, int position);

/** `as:serverAddress` of `ac:event`. */
void getRAIDEventServerAddress(char* destination, int position);

/** `as:serverName` of `ac:event`. */
void getRAIDEventServerName(char* destination, int position);

/* ----------------------------------------------------------------------------
 * Plain data. For callers to look at; only LOG_LEVEL and nextSequenceNumber are sensibly set, and
 * the latter rather through setRAIDEventSequenceNumber.
 */

/** Non-zero: the exchange that waits gives up. Cleared by each exchange that starts. */
extern unsigned char endFlag;

/** Non-zero: the current getEvent was cancelled. */
extern unsigned char cancelEvent;

/** 1: the next inventory count rebuilds the lists. */
extern unsigned char refresh;

/** Always 0. */
extern unsigned char initialized;

/** Non-zero once the settings file has been looked for. */
extern int configRead;

/** Messages up to this level are logged: 1 errors, 8 exchanges, 9 XML reading; 0 none. */
extern int LOG_LEVEL;

/** The number from which the next getEvent reads. */
extern int nextSequenceNumber;

/** Recursive; held while a configuration is fetched and read. */
extern pthread_mutex_t mutex_handle;

#pragma GCC visibility pop

#ifdef __cplusplus
}
#endif

#endif
