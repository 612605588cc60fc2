<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>AboutDialog</name>
    <message>
        <source>OK</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>About</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AccountManagementDialog</name>
    <message>
        <source>Change password for local server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Email</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Old password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>New password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>8 to 64 letters, digits and !%-.@^_~, with a lower-case and an upper-case letter, a digit and a symbol</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Account management</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Passwords do not match.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password does not meet the requirements.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Change password failed.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Changing password...</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AccountSetupDialog</name>
    <message>
        <source>First time login account setup</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Email</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>8 to 64 letters, digits and !%-.@^_~, with a lower-case and an upper-case letter, a digit and a symbol</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Next</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Account setup</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Passwords do not match.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password does not meet the requirements.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This email is already taken.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Create account failed.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Creating account...</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AddDeviceDialog</name>
    <message>
        <source>Search</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add Device Manually</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Import CSV</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Download template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Saves an example of a CSV file that can be imported</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Devices that can be added</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>0 of 0 devices selected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Open File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save as</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The search failed: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The device(s) found there are managed or listed already.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No device was found at %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No device was found from %1 to %2.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Nothing was done with the file: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The template was written.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The template could not be written: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; could not be read: %2.</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added to the list.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>There is no device in the file &quot;%1&quot;.</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) of the file are managed or listed already.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Line %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n row(s) of the file &quot;%1&quot; could not be read.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) sent; whether the server lists them could not be checked: %1.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>%1, %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The server does not list the device after it was sent.</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) could not be added.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>The devices could not be added: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 of %2 devices selected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Adding...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Working on the file...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reading what was found...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Searching... %1 of %2 seconds</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No device matches</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The search leaves none of the devices.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Searching for devices...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The server looks for devices on its network.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The search failed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Press Refresh to try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No new device found</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) answered, which are managed already.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Devices that the server does not reach by itself can be added manually or from a file.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AddDeviceManualDialog</name>
    <message>
        <source>By IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>192.168.0.10</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Port</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Any</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>By IP Range</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>From</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>192.168.0.1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>To</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>192.168.0.254</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add Device Manually</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The port must be a number from 1 to 65535.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The range ends before it begins.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The range has %1 addresses; %2 are the most that can be searched at once.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>1 address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 addresses</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>An address has four numbers from 0 to 255, as in 192.168.0.10.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AddServerDialog</name>
    <message>
        <source>Add Server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AlarmAnnouncer</name>
    <message numerus="yes">
        <source>Lost connection to %n device(s)</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AlarmPanel</name>
    <message>
        <source>Copy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete all</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Alarms</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Not read since %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No alarms.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Loading alarms...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The alarm list could not be read.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AlarmRecord</name>
    <message>
        <source>Server started</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Lost connection to %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Connection to %1 restored</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Memory card error on %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server stopped</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Authorization of %1 lost</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Alarm: %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ApiResult</name>
    <message>
        <source>the server did not answer</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the server answered with an error</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the server refused it</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the server&apos;s answer could not be read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>a secret could not be ciphered</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>nobody is logged in</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the file exists already or cannot be written</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>error %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AssignIpDialogII</name>
    <message>
        <source>IP Method</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IP Address(es)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>192.168.1.10-99, 192.168.2.*</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Subnet Mask</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Default Gateway</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Preferred DNS</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Optional</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Alternative DNS</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Devices that get addresses</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Total Quantity: 0</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Assign IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Auto</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Manual</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no IP address; the device keeps the one it had.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Total Quantity: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The field can’t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Each address has four parts: numbers from 0 to 255, ranges as in 10-19, or * for any.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This is no subnet mask, as 255.255.255.0 is one.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The gateway is no IP address.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The DNS server is no IP address.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IP conflicts or not enough available IP addresses. Pleasea use available IP or try a wider IP range.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The assignment could not be started.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AssignIpModel</name>
    <message>
        <source>Model</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>MAC</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Current IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>New IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Note</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>AuthorizeDeviceDialog</name>
    <message>
        <source>Authorize Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Username</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: their account is blocked for a while.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Account blocked</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) refused the last password; another wrong one may block the account.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Invalid password</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ConfirmDialog</name>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Are you sure you want to connect to another server? The present session ends.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Connect</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unfinished Task</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A task was requested and has not begun yet. It may fail when the session ends now. Are you sure you want to go on?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>End session</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Site Changes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There are unsaved/unapplied changes of sites, which are lost when the session ends now. Are you sure you want to go on?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Settings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There are settings that were changed and not applied. The changes are lost when the session ends now. Are you sure you want to go on?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unsaved Changes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>There are unsaved/unapplied changes on this page, which are lost when you leave it. Do you want to stay?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Stay</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel Task</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to cancel %n task(s)? Devices that are done already stay as they are.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Cancel task</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remove Finished Tasks</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to remove %n finished task(s) from the list, with their results? This action cannot be undone.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Remove</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete Alarms</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to delete %n alarm(s)? This action cannot be undone.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Delete</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete Device(s) from Device Overview</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Are you sure you want to delete the selected device(s) from the system permanently? This action cannot be undone.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete Device(s) from Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Are you sure you want to delete the copy of selected device(s) from this site? This action will not affect the list of Device Overview.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Are you sure you want to restart device? This operation may take some time.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restart</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Are you sure you want to delete the site? This action will also delete the sub-site(s) and the copy of selected device(s) of each site and sub-site.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Are you sure you want to disconnect from this service?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Disconnecting will stop the synchronization of all devices managed by this Device Manager. You will need to set up the connection again to restore synchronization.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Keep running</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Discard changes</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ConsoleCorner</name>
    <message>
        <source>Search devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Model, host name, firmware or site; an IP address, network (10.4.0.0/16) or range (10.4.0.10-20); a MAC address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remote connection</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Columns</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>CredentialRules</name>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Only alphanumeric characters are allowed.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Only alphanumeric characters and the following special characters !%-.@^_~ are allowed.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>CsvDevices</name>
    <message>
        <source>The row is not UTF-8 text.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A quotation mark is not closed.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The row has %1 column(s) in place of %2.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no port from 1 to 65535.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no IPv4 address.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no MAC address.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The MAC address &quot;%1&quot; stands in line %2 already.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>it is larger than %1 MiB</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>it is no text file</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The first line is read as the header.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>it is no file</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DBusToasts</name>
    <message>
        <source>Open</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceActions</name>
    <message>
        <source>%1: %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 of %2 devices are authorized.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 of %2 devices are authorized so far. %3.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 could not be started: the client is busy, try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Authorize Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 failed: %2.</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>The credentials are on their way to %n device(s).</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) deleted.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Deleting devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) removed from the site.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Removing devices from the site</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) moved.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added to the site.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) in the site already.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device record(s) could not be read.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Putting devices into the site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 failed: %2. Nothing was changed.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 may have failed: %2. Look at the list before you try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Exporting...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Exported successfully!</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The device list could not be exported: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The device list could not be exported.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 could not be started: %2.</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) were left out: the server does not manage them any more.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
</context>
<context>
    <name>DeviceDiscovery</name>
    <message>
        <source>the session has ended</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the client is busy, try again</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceFooter</name>
    <message>
        <source>Show only these</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%1 of %Ln device(s) selected</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 of %2 shown selected, %Ln device(s) in all</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>%1 authorized</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 unreachable</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 need attention</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n s</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n min</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Not updated for %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Updated just now</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Updated %1 ago</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceMenus</name>
    <message>
        <source>Copy cell</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Copy rows</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceRecords</name>
    <message>
        <source>Enabled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Disabled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Ready</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Error</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Detached</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Empty</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Mute</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unmute</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Status</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Model</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Host Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>MAC</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Firmware</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>HTTP Port</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>HTTPS Port</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>HTTPS</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IEEE 802.1X</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>SD Card Status</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>SD Card Usage(%)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Date/Time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Power Frequency(Hz)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Audio</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceStatus</name>
    <message>
        <source>Unauthorized</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Access Denied</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Authorized</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unreachable</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Maintaining...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Invalid Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Account Blocked</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceTab</name>
    <message>
        <source>Drag devices from the &quot;Device Overview&quot;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Clear filter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No device matches</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search and status chips leave no device of this tab.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Loading devices...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The device list could not be read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>It is read again as soon as the server answers.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceTabs</name>
    <message>
        <source>Camera</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>NVR</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Others</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceToolBar</name>
    <message>
        <source>Add Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Authorize Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Assign IP Address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Quick Setup</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Configuration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Backup Configuration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Replace Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export Device List</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export Debug Info</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload Firmware</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload Package</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload Configuration File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload Certificate</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>HTTPS</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IEEE 802.1x</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Create Template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Import Template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore to Restore Point</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore to Factory Default</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>More</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DeviceWindow</name>
    <message>
        <source>The devices are not managed any more.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Device List</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save as</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>CSV files (*.csv)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The device states could not be read. Try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The device is not managed any more.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DiscoveredModel</name>
    <message>
        <source>Discovered</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Found by IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>From file</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>EditServerDialog</name>
    <message>
        <source>Edit Server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>FailedTaskStrip</name>
    <message>
        <source>Start again</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%1 on %n device(s) did not begin. %2</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>1 of %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>FramelessDialog</name>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>FramelessWindow</name>
    <message>
        <source>Session Timeout</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>InvalidDeviceDialog</name>
    <message>
        <source>Devices that could not be added</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Invalid Devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reason</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>IpAssignment</name>
    <message numerus="yes">
        <source>Addresses given twice: %n device(s).</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Address given twice</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>Addresses of other devices: %n.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Address in use</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>Network, broadcast, gateway or reserved addresses: %n.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>No device address</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would not reach the gateway: it is in another subnet.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Gateway in another subnet</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ListActions</name>
    <message>
        <source>The task could not be cancelled: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The tasks could not be removed: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The alarms could not be deleted: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the client is busy, try again</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>LogChart</name>
    <message>
        <source>Log entries over time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 to %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>no entries</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>LogPager</name>
    <message>
        <source>Results per page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>First page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Previous page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Next page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Last page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>0 of 0</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 from %2</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>LogSidebar</name>
    <message>
        <source>Time Frame</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Start Time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>End Time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Source</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>All Sources</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Type</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>All Types</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Last hour</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Today</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>7 days</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1, date</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1, time of day</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>LogTable</name>
    <message>
        <source>Copy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Sort by %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>LogWindow</name>
    <message>
        <source>Date/Time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Source</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Type</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>User</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Description</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>System</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Alarm</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Event</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Audit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Other</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Log</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save as</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>CSV files (*.csv)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show the whole time frame</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search in the result</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Log entries</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Description of the selected entry</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select an entry to read its whole description.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Clear filters</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Retry</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Loading the log...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No log entry</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The log has nothing of this time frame.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No log entry matches</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The log could not be read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The time frame ends before it starts.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>the client is busy, try again</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Searching...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 Log Found</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 Logs Found</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Exporting...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Exported successfully!</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to export.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>LoginDialog</name>
    <message>
        <source>This Computer</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Email</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remote Server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Manage...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Manage saved servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Log in</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Login</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IP:Port/Domain Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Enter the server as an address or a name, with a port from 1 to 65535 behind a colon where it is not %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The login could not be carried out. Try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The server did not open a session. Try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server full.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Incorrect email or password. Try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Logging in...</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>MainConsoleMenu</name>
    <message>
        <source>All</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reset columns</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>MainWindow</name>
    <message>
        <source>Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Logs</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Settings</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Alarms</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>NoticeBar</name>
    <message>
        <source>Site changes detected. Update changes to the server promptly by clicking</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>Notifier</name>
    <message>
        <source>Open</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>OperationDialog</name>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>OperationTargets</name>
    <message numerus="yes">
        <source>%n device(s) will fail: not reachable.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Unreachable</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: not authorized.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Not authorized</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) at work for another task.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Busy</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>OrbTexts</name>
    <message>
        <source>Norvell Partner Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unable to connect to this service. Check connection information, then retry.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Oops! An unknown error happened. Try again or contact Norvell technical support for further assistance.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Incorrect email or password. Check account information via %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Invalid password: Password reset required or password expired. Check account information via %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>User does not exist. %1 via Norvell Partner Desk.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Become a Partner</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>PasswordEdit</name>
    <message>
        <source>Hide password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Show password</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>PasswordPolicy</name>
    <message>
        <source>At least one alphabetic character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one of these special characters: %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one numeric character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one lowercase character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one uppercase character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Not the same as the username</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>At least %n character(s)</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
</context>
<context>
    <name>PasswordPolicyDialog</name>
    <message>
        <source>Make your password policy with the following rules:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Minimum required length:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Minimum required length</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one alphabetic character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one numeric character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one of these special characters: !%-.@^_~ </source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one uppercase character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>At least one lowercase character</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password Policy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Prohibition of a password that is the same as the</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>username</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>PolicyView</name>
    <message>
        <source>The devices have no policy of their own.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ReconnectingDialog</name>
    <message>
        <source>Unable to establish a connection to the server. The client is currently attempting to reconnect to the server.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Trying again every few seconds...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reconnecting</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>RefreshDeviceDialog</name>
    <message>
        <source>Refreshing...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>RemoteConnectionDialog</name>
    <message>
        <source>Search</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search name or information</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Edit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Saved servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server Information</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The saved servers could not be read.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The list could not be saved; the saved one is as it was.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>RestoreDeviceDialog</name>
    <message>
        <source>Network</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Daylight saving time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Custom language</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>NADP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Focus position</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Lens configuration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore to Factory Default</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore all settings to factory default, including:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Devices whose network settings are restored may get another address and be cut off from the server.</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>The settings of %n device(s) will be lost. Type %n to go on.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
</context>
<context>
    <name>ServerDialog</name>
    <message>
        <source>Server Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server Information</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>IP:Port/Domain Name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Email</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Enter an address or a name, with a port from 1 to 65535 behind a colon if need be.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ServerSettings</name>
    <message>
        <source>%1: the server&apos;s value %2 cannot be shown.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1: the server has %2, shown is %3.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Notification banners for alarms</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Notification banners for tasks</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Language</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Number of days to keep logs</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Default File Location</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Automatic restore points</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Number of automatic restore points to keep</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Limit of firmware uploads</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Number of simultaneous firmware uploads</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>on</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>off</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>(empty)</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ServiceManagement</name>
    <message>
        <source>connecting to ORB...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Only an administrator can connect the service.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ServiceManagementAddServiceDialog</name>
    <message>
        <source>1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose a Norvell service to connect</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Service</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select a Norvell Service</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Email</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Choose a location to synchronize devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Organization</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select an Organization</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select a Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Back</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Next</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Orb</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Accounts, organizations and sites are managed in the %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Norvell Partner Desk</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Session expired. Click &apos;Back&apos; to go to the previous step and try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No organization or site exist. Create an organization first or site.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>One or more customers do not have remote access permission.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Applying...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Applied successfully</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Signing in...</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>ServiceManagementStatusDialog</name>
    <message>
        <source>Service Connected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The devices managed by this Device Manager are synced with the Norvell service. Disconnecting will stop synchronization, requiring re-setup to restore it.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remote Access</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Granting technical support personnel remote access to the devices for viewing device status, performing maintenance, and troubleshooting.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Reading the status...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The status is not known.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Connected</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Not connected at the moment</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Only an administrator can change this.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Remote Access...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set remote access successfully!</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to set remote access.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Disconnecting...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Disconnected successfully!</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SetPasswordDialog</name>
    <message>
        <source>Strength: weak</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Strength: fair</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Strength: strong</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Strength: --</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Username</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>New Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Generate a password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Edit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Password Policy</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will refuse this password by their policy.</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>Against its policy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>New Password and Confirm Password don&apos;t match.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SettingWindow</name>
    <message>
        <source>Retry</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Apply</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Changes were taken back.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The settings could not be read: the client is busy, try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Loading settings...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The settings could not be read: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The server offers no settings.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The settings could not be saved: the client is busy, try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Saving settings...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The settings could not be saved: %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Settings saved.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The server&apos;s settings were kept.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SettingsChangedDialog</name>
    <message>
        <source>Settings Changed Meanwhile</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Somebody else has changed these settings since you opened the page. Nothing is saved yet.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Setting</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This page</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server now</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Save this page&apos;s values</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Keep the server&apos;s values</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SettingsForm</name>
    <message>
        <source>Client</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Notification</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pop up  notification banners for all the alarms</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Pop up  notification banners for all the tasks</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Language</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Log</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Number of days to keep logs</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Device Management</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Default File Location</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Configuration Restore Point</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Create configuration restore points automatically every night if configuration changes are detected.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Number of automatic restore points to keep</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>for each camera</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Firmware Upload Limit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload firmware to up to</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload firmware to up to so many devices simultaneously.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>devices simultaneously.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Browse</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select Directory</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Language of the user interface</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>As the system</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SidePanel</name>
    <message>
        <source>Alarms</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SiteCommit</name>
    <message>
        <source>The site changes could not be sent. Press Apply to try again.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The site changes could not be sent: %1. Press Apply to try again.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SiteEdits</name>
    <message>
        <source>Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The site does not exist any more.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A site needs a name.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The name of a site has at most %1 characters.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A site cannot be moved into itself.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The site is there already.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The target does not exist any more.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A site cannot be moved into one of its sub-sites.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Sites nest at most %1 levels deep.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The site &quot;%1&quot; was deleted by somebody else, and your changes to it with it.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The site &quot;%1&quot; stays where it was, since somebody else has changed the sites there.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The new site &quot;%1&quot; is gone, since somebody else has changed the sites above it.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SiteTree</name>
    <message>
        <source>Site name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>(no name)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Copy %1 device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Copy %1 devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Move %1 device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Move %1 devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Sites</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add a site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>DEVICE</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>SITE MANAGEMENT</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Device Overview</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Add Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Edit Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Delete Site</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>A site can only be dropped on a site or between sites.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Devices can only be dropped on a site.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>StartCheck</name>
    <message>
        <source>Norvell Device Manager Service Control is not installed on this computer. Please connect to a remote server.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Norvell Device Manager Service Control is not running on this computer. Please check the status of local server or connect to a remote server.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TargetBox</name>
    <message>
        <source>Show</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) selected</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>%1 of %2 devices selected</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TargetListDialog</name>
    <message>
        <source>Devices</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TargetModel</name>
    <message>
        <source>%1, %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Note</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TargetWarningLines</name>
    <message>
        <source>Leave them out</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TaskAnnouncer</name>
    <message>
        <source>Task - Upload Firmware created</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Task - Upload Firmware processing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Task - Upload Firmware finished</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Task - Upload Configuration File processing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Task - Upload Configuration File finished</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Task - Upload Package File processing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Task - Upload Package File finished</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TaskDelegate</name>
    <message>
        <source>Scheduled for %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) · %1</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
</context>
<context>
    <name>TaskPanel</name>
    <message>
        <source>Copy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Retry failed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel task</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remove</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>All</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Active</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remove finished</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Remove all finished tasks from the list</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Search task, user, model, IP, MAC, state</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Loading tasks...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The task list could not be read.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No tasks.
What is done to devices shows here.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>No task matches the filter.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The tasks could not be read since %1.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>This client cannot retry the task: it was started elsewhere or before the last log-in, so its settings are not known here.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Retrying asks for the password or key again.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TaskQueue</name>
    <message>
        <source>Reason: %1.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TaskState</name>
    <message>
        <source>Requesting</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Queuing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Processing</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>(1/3) File is uploading...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>(2/3) Device is updating...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>(3/3) Device is reconnecting...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Scheduled</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Applied successfully</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Uploaded successfully</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Mismatching status</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Unsupported method</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Mismatching private key and certificate</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Invalid file or public key</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Certificate not installed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Not installed</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Device response timeout</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Device response timeout. Contact Norvell technical support for further assistant.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to connect to device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to connect to device. Check device status and connection, then retry.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to set password to device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Invalid file for this model group</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to upload: Incompatible Firmware. Check the firmware release notes for compatibility.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to upload: No SD card detected. Check SD card status, then retry.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> SD card error. Check SD card status, then retry.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> Reached maximum package upload limit. Check package status, then retry.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> Insufficient storage. Check storage status, then retry.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> Broken or invalid file. Select valid file, then retry.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source> Internal process error.Contact Norvell technical support for further assistant.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Failed to upload: </source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TaskTexts</name>
    <message numerus="yes">
        <source>%n device(s): %1</source>
        <translation type="unfinished">
            <numerusform></numerusform>
            <numerusform></numerusform>
        </translation>
    </message>
    <message>
        <source>%1 of %2 failed: %3</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Started at %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Started by %1 at %2</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Scheduled for %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>an unknown time</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TaskType</name>
    <message>
        <source>Upload Firmware</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload Configuration File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload Package</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Generate HTTPS Certificate</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Install HTTPS Certificate</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload HTTPS Certificate and Key</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload IEEE 802.1x Certificate (EAP-PEAP)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Upload IEEE 802.1x Certificate (EAP-TLS)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Assign IP Address (Auto)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Assign IP Address (Manual)</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Export Debug Info</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Quick Setup</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore Device</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Password Policy</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Create Template</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Set Configuration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Custom Command</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Task</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TitleBar</name>
    <message>
        <source>Help</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Account</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Minimize</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Maximize</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Restore</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Close</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Account Management</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>About</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Log off</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The service is connected.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>Transfer</name>
    <message>
        <source>It was cancelled.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file “%1” cannot be read.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file “%1” is empty.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file “%1” was changed while it was being sent.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file “%1” disappeared while it was being sent.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The service refused it or the connection was lost.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Nothing got through to the service for too long.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The service does not take files of this size.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>The file “%1” exists already or cannot be written.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TransferStrip</name>
    <message>
        <source>Upload progress</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 of %2, %3 per second</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>%1 sent, waiting for the server.</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <source>Cancelling...</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>WelcomePage</name>
    <message>
        <source>Log in</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>main</name>
    <message>
        <source>Norvell Device Manager</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
