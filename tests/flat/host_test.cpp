// The library in a process that loads it by name and knows no header of it.

#include <dlfcn.h>
#include <elf.h>
#include <gtest/gtest.h>
#include <link.h>
#include <pthread.h>

#include <string>
#include <vector>

#include "exported.h"
#include "support/elements.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

class Host : public testing::Test {
protected:
    Host() {
        if (library == nullptr) {
            throw std::runtime_error(dlerror());
        }
    }
    ~Host() override {
        if (library != nullptr) {
            dlclose(library);
        }
    }

    void unload() { EXPECT_EQ(dlclose(std::exchange(library, nullptr)), 0); }

    template <class Function>
    [[nodiscard]] Function* function(const std::string& name) const {
        return exported<Function>(name, library);
    }

    template <class Type>
    [[nodiscard]] Type variable(const char* name) const {
        return *static_cast<const Type*>(dlsym(library, name));
    }

    [[nodiscard]] std::size_t sizeOf(const char* name) const {
        Dl_info info{};
        const ElfW(Sym)* symbol = nullptr;
        void* extra = nullptr;
        if (dladdr1(dlsym(library, name), &info, &extra, RTLD_DL_SYMENT) == 0) {
            return 0;
        }
        symbol = static_cast<const ElfW(Sym)*>(extra);
        return symbol == nullptr ? 0 : symbol->st_size;
    }

private:
    void* library = dlopen(RAID_LIBRARY, RTLD_NOW | RTLD_LOCAL);
};

struct Global {
    const char* name;
    std::size_t size;
};

TEST_F(Host, FindsTheGlobalsWithTheirSizes) {
    constexpr std::size_t list = sizeof(std::vector<int>);
    for (const auto& [name, size] : {
             Global{"endFlag", 1},
             Global{"cancelEvent", 1},
             Global{"refresh", 1},
             Global{"initialized", 1},
             Global{"configRead", 4},
             Global{"LOG_LEVEL", 4},
             Global{"nextSequenceNumber", 4},
             Global{"raidSystem", sizeof(void*)},
             Global{"raidEvents", sizeof(void*)},
             Global{"mutex_handle", sizeof(pthread_mutex_t)},
             Global{"PellionAdapterList", list},
             Global{"LSIAdapterList", list},
             Global{"VantryAdapterList", list},
             Global{"ChannelList", list},
             Global{"RAIDArrayList", list},
             Global{"SpannedRAIDArrayList", list},
             Global{"RAIDLogicalDriveList", list},
             Global{"RAIDDiskDriveList", list},
             Global{"RAIDEnclosureDeviceList", list},
             Global{"RAIDFanList", list},
             Global{"RAIDPowerSupplyList", list},
             Global{"RAIDTempSensorList", list},
             Global{"RAIDEventList", list},
         }) {
        EXPECT_EQ(sizeOf(name), size) << name;
    }
}

TEST_F(Host, FindsTheGlobalsAtRest) {
    for (const char* const flag : {"endFlag", "cancelEvent", "refresh", "initialized"}) {
        EXPECT_EQ(variable<unsigned char>(flag), 0) << flag;
    }
    for (const char* const number : {"configRead", "LOG_LEVEL", "nextSequenceNumber"}) {
        EXPECT_EQ(variable<int>(number), 0) << number;
    }
    for (const char* const pointer : {"raidSystem", "raidEvents"}) {
        EXPECT_EQ(variable<const void*>(pointer), nullptr) << pointer;
    }
}

TEST_F(Host, FindsTheDecoratedFunctionsUnderTheirNames) {
    for (const char* const name :
         {"_Z9getConfigv", "_Z5packIPvi",
          "_Z5packSPvNSt7__cxx1112basic_stringIcSt11char_traitsIcESaIcEEE",
          "_Z6packAIPvSt6vectorIiSaIiEE",
          "_Z6packASPvSt6vectorINSt7__cxx1112basic_stringIcSt11char_traitsIcESaIcEEESaIS6_EE"}) {
        EXPECT_NO_THROW((void)function<void()>(name));
    }
    char packed[8] = {};
    EXPECT_EQ(function<void*(void*, int)>("_Z5packIPvi")(packed, 7), packed + 8);
}

// The publication of one record in each list.
std::string oneOfEach() {
    const auto channel = element("ac:channel",
                                 "<ac:hardDrive/><ac:enclosure><ac:fan/><ac:powerSupply/>"
                                 "<ac:tempSensor/></ac:enclosure>");
    const auto content = element("ac:physicalDrives", channel) +
                         "<ac:logicalDrives><ac:logicalDrive/></ac:logicalDrives>"
                         "<ac:arrays><ac:basicArray/><ac:spannedArray/></ac:arrays>";
    return configDocument(element("ac:system", element("ac:adapter", content, "o:PellionAdapter") +
                                                   element("ac:adapter", "", "o:LSIAdapter") +
                                                   element("ac:adapter", "", "o:DorvelAdapter")));
}

TEST_F(Host, UnloadsTheLibraryWithFullLists) {
    {
        const ScriptedService service(
            {answering(oneOfEach()), answering("<any/>"),
             answering(eventsDocument("<ac:events><ac:event/></ac:events>"))});
        function<int()>("RAIDinit")();
        function<int()>("getEvent")();
    }
    for (const char* const list :
         {"PellionAdapter", "LSIAdapter", "VantryAdapter", "Channel", "Array", "SpannedArray",
          "RAIDLogicalDrive", "RAIDDiskDrive", "RAIDEnclosureDevice", "RAIDFan", "RAIDPowerSupply",
          "RAIDTempSensor", "RAIDEvent"}) {
        EXPECT_EQ(function<int()>("get" + std::string(list) + "Count")(), 1) << list;
    }
    unload();
    EXPECT_EQ(dlopen(RAID_LIBRARY, RTLD_NOW | RTLD_NOLOAD), nullptr);
}

TEST_F(Host, FindsTheListsEmptyAgainAfterLoadingTheLibraryAnew) {
    {
        const ScriptedService service({answering(oneOfEach())});
        function<int()>("RAIDinit")();
    }
    unload();
    void* const again = dlopen(RAID_LIBRARY, RTLD_NOW | RTLD_LOCAL);
    ASSERT_NE(again, nullptr);
    EXPECT_EQ(exported<int()>("getChannelCount", again)(), 0);
    dlclose(again);
}

}  // namespace
