// Which cities the picker finds on the device.
#pragma once

#include <memory>
#include <string>

class CatalogueForTest;

/** A folder of resources like the built one, with other cities on demand. */
class PickerWorld {
public:
    /** @param folder An existing folder, which gets the resources. */
    explicit PickerWorld(const std::string& folder);
    ~PickerWorld();
    PickerWorld(const PickerWorld&) = delete;
    PickerWorld& operator=(const PickerWorld&) = delete;

    const std::string& resources() const { return _resources; }
    /** Pickers that open from now on have the application's own cities. */
    void useOwnCities();
    /** Pickers that open from now on have far more cities. @return False when there are none. */
    bool useManyCities();

private:
    void use(const std::string& database) const;
    bool makeManyCities();

    std::string _folder;
    std::string _resources;
    std::unique_ptr<CatalogueForTest> _names;
};
