<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de" sourcelanguage="en">
<context>
    <name>AboutDialog</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>About</source>
        <translation>Info</translation>
    </message>
    <message>
        <source>The program is built with the work of others, under these licences:</source>
        <translation>Das Programm baut auf der Arbeit anderer auf, unter diesen Lizenzen:</translation>
    </message>
    <message>
        <source>Licences</source>
        <translation>Lizenzen</translation>
    </message>
    <message>
        <source>Component</source>
        <translation>Bestandteil</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>Version</translation>
    </message>
    <message>
        <source>Licence</source>
        <translation>Lizenz</translation>
    </message>
    <message>
        <source>Key fingerprint</source>
        <translation>Fingerabdruck des Schlüssels</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Key of the service on this computer (SHA-256)</source>
        <translation>Schlüssel des Dienstes auf diesem Computer (SHA-256)</translation>
    </message>
    <message>
        <source>Key of the server %1 (SHA-256)</source>
        <translation>Schlüssel des Servers %1 (SHA-256)</translation>
    </message>
</context>
<context>
    <name>AccountManagementDialog</name>
    <message>
        <source>Change password for local server</source>
        <translation>Passwort für den lokalen Server ändern</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-Mail</translation>
    </message>
    <message>
        <source>Old password</source>
        <translation>Altes Passwort</translation>
    </message>
    <message>
        <source>New password</source>
        <translation>Neues Passwort</translation>
    </message>
    <message>
        <source>8 to 64 letters, digits and !%-.@^_~, with a lower-case and an upper-case letter, a digit and a symbol</source>
        <translation>8 bis 64 Buchstaben, Ziffern und !%-.@^_~, mit Klein- und Großbuchstabe, Ziffer und Sonderzeichen</translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation>Passwort bestätigen</translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation>Zugangsdaten merken</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>Account management</source>
        <translation>Kontoverwaltung</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Passwords do not match.</source>
        <translation>Die Passwörter stimmen nicht überein.</translation>
    </message>
    <message>
        <source>Password does not meet the requirements.</source>
        <translation>Das Passwort erfüllt die Anforderungen nicht.</translation>
    </message>
    <message>
        <source>Change password failed.</source>
        <translation>Das Passwort konnte nicht geändert werden.</translation>
    </message>
    <message>
        <source>Changing password...</source>
        <translation>Passwort wird geändert ...</translation>
    </message>
</context>
<context>
    <name>AccountSetupDialog</name>
    <message>
        <source>First time login account setup</source>
        <translation>Konto für die erste Anmeldung einrichten</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-Mail</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>8 to 64 letters, digits and !%-.@^_~, with a lower-case and an upper-case letter, a digit and a symbol</source>
        <translation>8 bis 64 Buchstaben, Ziffern und !%-.@^_~, mit Klein- und Großbuchstabe, Ziffer und Sonderzeichen</translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation>Passwort bestätigen</translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation>Zugangsdaten merken</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Weiter</translation>
    </message>
    <message>
        <source>Account setup</source>
        <translation>Konto einrichten</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Passwords do not match.</source>
        <translation>Die Passwörter stimmen nicht überein.</translation>
    </message>
    <message>
        <source>Password does not meet the requirements.</source>
        <translation>Das Passwort erfüllt die Anforderungen nicht.</translation>
    </message>
    <message>
        <source>This email is already taken.</source>
        <translation>Diese E-Mail-Adresse ist bereits vergeben.</translation>
    </message>
    <message>
        <source>Create account failed.</source>
        <translation>Das Konto konnte nicht erstellt werden.</translation>
    </message>
    <message>
        <source>Creating account...</source>
        <translation>Konto wird erstellt ...</translation>
    </message>
</context>
<context>
    <name>AddDeviceDialog</name>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>Modell, IP oder MAC suchen</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Aktualisieren</translation>
    </message>
    <message>
        <source>Add Device Manually</source>
        <translation>Gerät manuell hinzufügen</translation>
    </message>
    <message>
        <source>Import CSV</source>
        <translation>CSV importieren</translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation>Alle auswählen/abwählen</translation>
    </message>
    <message>
        <source>Download template</source>
        <translation>Vorlage herunterladen</translation>
    </message>
    <message>
        <source>Saves an example of a CSV file that can be imported</source>
        <translation>Speichert ein Beispiel einer CSV-Datei, die importiert werden kann</translation>
    </message>
    <message>
        <source>Devices that can be added</source>
        <translation>Geräte, die hinzugefügt werden können</translation>
    </message>
    <message>
        <source>0 of 0 devices selected</source>
        <translation>0 von 0 Geräten ausgewählt</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Hinzufügen</translation>
    </message>
    <message>
        <source>Add Device</source>
        <translation>Gerät hinzufügen</translation>
    </message>
    <message>
        <source>Open File</source>
        <translation>Datei öffnen</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>Geräte</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Speichern unter</translation>
    </message>
    <message>
        <source>The search failed: %1.</source>
        <translation>Die Suche ist fehlgeschlagen: %1.</translation>
    </message>
    <message>
        <source>No device was found at %1.</source>
        <translation>Unter %1 wurde kein Gerät gefunden.</translation>
    </message>
    <message>
        <source>No device was found from %1 to %2.</source>
        <translation>Von %1 bis %2 wurde kein Gerät gefunden.</translation>
    </message>
    <message>
        <source>Nothing was done with the file: %1.</source>
        <translation>Mit der Datei wurde nichts getan: %1.</translation>
    </message>
    <message>
        <source>The template was written.</source>
        <translation>Die Vorlage wurde gespeichert.</translation>
    </message>
    <message>
        <source>The template could not be written: %1.</source>
        <translation>Die Vorlage konnte nicht gespeichert werden: %1.</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; could not be read: %2.</source>
        <translation>Die Datei „%1“ konnte nicht gelesen werden: %2.</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added to the list.</source>
        <translation>
            <numerusform>%n Gerät zur Liste hinzugefügt.</numerusform>
            <numerusform>%n Geräte zur Liste hinzugefügt.</numerusform>
        </translation>
    </message>
    <message>
        <source>There is no device in the file &quot;%1&quot;.</source>
        <translation>Die Datei „%1“ enthält kein Gerät.</translation>
    </message>
    <message>
        <source>Line %1</source>
        <translation>Zeile %1</translation>
    </message>
    <message numerus="yes">
        <source>%n row(s) of the file &quot;%1&quot; could not be read.</source>
        <translation>
            <numerusform>%n Zeile der Datei „%1“ konnte nicht gelesen werden.</numerusform>
            <numerusform>%n Zeilen der Datei „%1“ konnten nicht gelesen werden.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) sent; whether the server lists them could not be checked: %1.</source>
        <translation>
            <numerusform>%n Gerät gesendet; ob der Server es aufführt, konnte nicht geprüft werden: %1.</numerusform>
            <numerusform>%n Geräte gesendet; ob der Server sie aufführt, konnte nicht geprüft werden: %1.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added.</source>
        <translation>
            <numerusform>%n Gerät hinzugefügt.</numerusform>
            <numerusform>%n Geräte hinzugefügt.</numerusform>
        </translation>
    </message>
    <message>
        <source>%1, %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>The server does not list the device after it was sent.</source>
        <translation>Der Server führt das Gerät nach dem Senden nicht auf.</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) could not be added.</source>
        <translation>
            <numerusform>%n Gerät konnte nicht hinzugefügt werden.</numerusform>
            <numerusform>%n Geräte konnten nicht hinzugefügt werden.</numerusform>
        </translation>
    </message>
    <message>
        <source>The devices could not be added: %1.</source>
        <translation>Die Geräte konnten nicht hinzugefügt werden: %1.</translation>
    </message>
    <message>
        <source>%1 of %2 devices selected</source>
        <translation>%1 von %2 Geräten ausgewählt</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Adding...</source>
        <translation>Wird hinzugefügt ...</translation>
    </message>
    <message>
        <source>Working on the file...</source>
        <translation>Datei wird verarbeitet ...</translation>
    </message>
    <message>
        <source>Reading what was found...</source>
        <translation>Suchergebnisse werden gelesen ...</translation>
    </message>
    <message>
        <source>Searching... %1 of %2 seconds</source>
        <translation>Suche läuft ... %1 von %2 Sekunden</translation>
    </message>
    <message>
        <source>No device matches</source>
        <translation>Kein Gerät passt</translation>
    </message>
    <message>
        <source>The search leaves none of the devices.</source>
        <translation>Die Suche lässt kein Gerät übrig.</translation>
    </message>
    <message>
        <source>Searching for devices...</source>
        <translation>Geräte werden gesucht ...</translation>
    </message>
    <message>
        <source>The server looks for devices on its network.</source>
        <translation>Der Server sucht in seinem Netzwerk nach Geräten.</translation>
    </message>
    <message>
        <source>The search failed</source>
        <translation>Die Suche ist fehlgeschlagen</translation>
    </message>
    <message>
        <source>Press Refresh to try again.</source>
        <translation>Mit „Aktualisieren“ erneut versuchen.</translation>
    </message>
    <message>
        <source>No new device found</source>
        <translation>Kein neues Gerät gefunden</translation>
    </message>
    <message>
        <source>Devices that the server does not reach by itself can be added manually or from a file.</source>
        <translation>Geräte, die der Server nicht von selbst erreicht, können manuell oder aus einer Datei hinzugefügt werden.</translation>
    </message>
    <message>
        <source>Waiting for the list of managed devices...</source>
        <translation>Warten auf die Liste der verwalteten Geräte...</translation>
    </message>
    <message>
        <source>What was found there is managed or listed already.</source>
        <translation>Was dort gefunden wurde, wird bereits verwaltet oder steht schon in der Liste.</translation>
    </message>
    <message numerus="yes">
        <source>Managed or listed already: %n device(s) of the file.</source>
        <translation>
            <numerusform>%n Gerät der Datei wird bereits verwaltet oder steht schon in der Liste.</numerusform>
            <numerusform>%n Geräte der Datei werden bereits verwaltet oder stehen schon in der Liste.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Managed already and left as they are: %n device(s).</source>
        <translation>
            <numerusform>%n Gerät war bereits verwaltet und bleibt, wie es ist.</numerusform>
            <numerusform>%n Geräte waren bereits verwaltet und bleiben, wie sie sind.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Managed already: %n device(s) that answered.</source>
        <translation>
            <numerusform>%n Gerät hat geantwortet, das bereits verwaltet wird.</numerusform>
            <numerusform>%n Geräte haben geantwortet, die bereits verwaltet werden.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) without a good MAC address answered, which cannot be added.</source>
        <translation>
            <numerusform>%n Gerät ohne gültige MAC-Adresse hat geantwortet und kann nicht hinzugefügt werden.</numerusform>
            <numerusform>%n Geräte ohne gültige MAC-Adresse haben geantwortet und können nicht hinzugefügt werden.</numerusform>
        </translation>
    </message>
    <message>
        <source>The first %1 are listed.</source>
        <translation>Die ersten %1 werden aufgeführt.</translation>
    </message>
</context>
<context>
    <name>AddDeviceManualDialog</name>
    <message>
        <source>By IP</source>
        <translation>Nach IP</translation>
    </message>
    <message>
        <source>IP</source>
        <translation>IP</translation>
    </message>
    <message>
        <source>192.168.0.10</source>
        <translation>192.168.0.10</translation>
    </message>
    <message>
        <source>Port</source>
        <translation>Port</translation>
    </message>
    <message>
        <source>Any</source>
        <translation>Beliebig</translation>
    </message>
    <message>
        <source>By IP Range</source>
        <translation>Nach IP-Bereich</translation>
    </message>
    <message>
        <source>From</source>
        <translation>Von</translation>
    </message>
    <message>
        <source>192.168.0.1</source>
        <translation>192.168.0.1</translation>
    </message>
    <message>
        <source>To</source>
        <translation>Bis</translation>
    </message>
    <message>
        <source>192.168.0.254</source>
        <translation>192.168.0.254</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Hinzufügen</translation>
    </message>
    <message>
        <source>Add Device Manually</source>
        <translation>Gerät manuell hinzufügen</translation>
    </message>
    <message>
        <source>The port must be a number from 1 to 65535.</source>
        <translation>Der Port muss eine Zahl von 1 bis 65535 sein.</translation>
    </message>
    <message>
        <source>The range ends before it begins.</source>
        <translation>Der Bereich endet, bevor er beginnt.</translation>
    </message>
    <message>
        <source>The range has %1 addresses; %2 are the most that can be searched at once.</source>
        <translation>Der Bereich hat %1 Adressen; höchstens %2 können auf einmal durchsucht werden.</translation>
    </message>
    <message>
        <source>1 address</source>
        <translation>1 Adresse</translation>
    </message>
    <message>
        <source>%1 addresses</source>
        <translation>%1 Adressen</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>An address has four numbers from 0 to 255, as in 192.168.0.10.</source>
        <translation>Eine Adresse besteht aus vier Zahlen von 0 bis 255, etwa 192.168.0.10.</translation>
    </message>
</context>
<context>
    <name>AddServerDialog</name>
    <message>
        <source>Add Server</source>
        <translation>Server hinzufügen</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Hinzufügen</translation>
    </message>
</context>
<context>
    <name>AlarmAnnouncer</name>
    <message numerus="yes">
        <source>Lost connection to %n device(s)</source>
        <translation>
            <numerusform>Verbindung zu %n Gerät verloren</numerusform>
            <numerusform>Verbindung zu %n Geräten verloren</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AlarmModel</name>
    <message>
        <source>Unread</source>
        <translation>Ungelesen</translation>
    </message>
</context>
<context>
    <name>AlarmPanel</name>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Delete all</source>
        <translation>Alle löschen</translation>
    </message>
    <message>
        <source>Alarms</source>
        <translation>Alarme</translation>
    </message>
    <message>
        <source>Not read since %1</source>
        <translation>Seit %1 nicht gelesen</translation>
    </message>
    <message>
        <source>No alarms.</source>
        <translation>Keine Alarme.</translation>
    </message>
    <message>
        <source>Loading alarms...</source>
        <translation>Alarme werden geladen ...</translation>
    </message>
    <message>
        <source>The alarm list could not be read.</source>
        <translation>Die Alarmliste konnte nicht gelesen werden.</translation>
    </message>
</context>
<context>
    <name>AlarmRecord</name>
    <message>
        <source>Server started</source>
        <translation>Server gestartet</translation>
    </message>
    <message>
        <source>Lost connection to %1</source>
        <translation>Verbindung zu %1 verloren</translation>
    </message>
    <message>
        <source>Connection to %1 restored</source>
        <translation>Verbindung zu %1 wiederhergestellt</translation>
    </message>
    <message>
        <source>Memory card error on %1</source>
        <translation>Speicherkartenfehler auf %1</translation>
    </message>
    <message>
        <source>Server stopped</source>
        <translation>Server beendet</translation>
    </message>
    <message>
        <source>Authorization of %1 lost</source>
        <translation>Autorisierung von %1 verloren</translation>
    </message>
    <message>
        <source>Alarm: %1</source>
        <translation>Alarm: %1</translation>
    </message>
</context>
<context>
    <name>ApiResult</name>
    <message>
        <source>the server did not answer</source>
        <translation>der Server hat nicht geantwortet</translation>
    </message>
    <message>
        <source>the server answered with an error</source>
        <translation>der Server hat mit einem Fehler geantwortet</translation>
    </message>
    <message>
        <source>the server refused it</source>
        <translation>der Server hat es abgelehnt</translation>
    </message>
    <message>
        <source>the server&apos;s answer could not be read</source>
        <translation>die Antwort des Servers konnte nicht gelesen werden</translation>
    </message>
    <message>
        <source>a secret could not be ciphered</source>
        <translation>ein Geheimnis konnte nicht verschlüsselt werden</translation>
    </message>
    <message>
        <source>the file exists already or cannot be written</source>
        <translation>die Datei ist schon vorhanden oder kann nicht geschrieben werden</translation>
    </message>
    <message>
        <source>error %1</source>
        <translation>Fehler %1</translation>
    </message>
    <message>
        <source>the server&apos;s key has changed</source>
        <translation>der Schlüssel des Servers hat sich geändert</translation>
    </message>
    <message>
        <source>nothing was sent, because something in it is missing or not allowed</source>
        <translation>es wurde nichts gesendet, weil etwas darin fehlt oder nicht erlaubt ist</translation>
    </message>
    <message>
        <source>the server does not know the session any more</source>
        <translation>der Server kennt die Sitzung nicht mehr</translation>
    </message>
    <message>
        <source>the server takes no more sessions</source>
        <translation>der Server nimmt keine weiteren Sitzungen an</translation>
    </message>
</context>
<context>
    <name>AssignIpDialogII</name>
    <message>
        <source>IP Method</source>
        <translation>IP-Vergabe</translation>
    </message>
    <message>
        <source>IP Address(es)</source>
        <translation>IP-Adresse(n)</translation>
    </message>
    <message>
        <source>192.168.1.10-99, 192.168.2.*</source>
        <translation>192.168.1.10-99, 192.168.2.*</translation>
    </message>
    <message>
        <source>Subnet Mask</source>
        <translation>Subnetzmaske</translation>
    </message>
    <message>
        <source>Default Gateway</source>
        <translation>Standardgateway</translation>
    </message>
    <message>
        <source>Preferred DNS</source>
        <translation>Bevorzugter DNS</translation>
    </message>
    <message>
        <source>Optional</source>
        <translation>Optional</translation>
    </message>
    <message>
        <source>Alternative DNS</source>
        <translation>Alternativer DNS</translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation>Alle auswählen/abwählen</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>Modell, IP oder MAC suchen</translation>
    </message>
    <message>
        <source>Devices that get addresses</source>
        <translation>Geräte, die Adressen erhalten</translation>
    </message>
    <message>
        <source>Total Quantity: 0</source>
        <translation>Gesamtzahl: 0</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>Assign IP</source>
        <translation>IP zuweisen</translation>
    </message>
    <message>
        <source>Auto</source>
        <translation>Automatisch</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Manuell</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no IP address; the device keeps the one it had.</source>
        <translation>„%1“ ist keine IP-Adresse; das Gerät behält seine bisherige.</translation>
    </message>
    <message>
        <source>Total Quantity: %1</source>
        <translation>Gesamtzahl: %1</translation>
    </message>
    <message>
        <source>The field can’t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Each address has four parts: numbers from 0 to 255, ranges as in 10-19, or * for any.</source>
        <translation>Jede Adresse hat vier Teile: Zahlen von 0 bis 255, Bereiche wie 10-19 oder * für alle.</translation>
    </message>
    <message>
        <source>This is no subnet mask, as 255.255.255.0 is one.</source>
        <translation>Das ist keine Subnetzmaske wie etwa 255.255.255.0.</translation>
    </message>
    <message>
        <source>The gateway is no IP address.</source>
        <translation>Das Gateway ist keine IP-Adresse.</translation>
    </message>
    <message>
        <source>The DNS server is no IP address.</source>
        <translation>Der DNS-Server ist keine IP-Adresse.</translation>
    </message>
    <message>
        <source>IP conflicts or not enough available IP addresses. Pleasea use available IP or try a wider IP range.</source>
        <translation>IP-Konflikte oder zu wenige verfügbare IP-Adressen. Bitte verfügbare Adressen oder einen größeren IP-Bereich verwenden.</translation>
    </message>
    <message>
        <source>The assignment could not be started.</source>
        <translation>Die Zuweisung konnte nicht gestartet werden.</translation>
    </message>
    <message>
        <source>The addresses in use could not be read. Press Apply to try again.</source>
        <translation>Die belegten Adressen konnten nicht gelesen werden. Mit „Übernehmen“ erneut versuchen.</translation>
    </message>
    <message>
        <source>Some of the addresses were taken meanwhile, so others are given now. Look at them and press Apply again.</source>
        <translation>Einige der Adressen wurden inzwischen belegt, deshalb werden nun andere vergeben. Prüfen Sie sie und wählen Sie noch einmal „Übernehmen“.</translation>
    </message>
</context>
<context>
    <name>AssignIpModel</name>
    <message>
        <source>Model</source>
        <translation>Modell</translation>
    </message>
    <message>
        <source>MAC</source>
        <translation>MAC</translation>
    </message>
    <message>
        <source>Current IP</source>
        <translation>Aktuelle IP</translation>
    </message>
    <message>
        <source>New IP</source>
        <translation>Neue IP</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Hinweis</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>Automatisch</translation>
    </message>
</context>
<context>
    <name>AuthorizeDeviceDialog</name>
    <message>
        <source>Authorize Device</source>
        <translation>Gerät autorisieren</translation>
    </message>
    <message>
        <source>Username</source>
        <translation>Benutzername</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: their account is blocked for a while.</source>
        <translation>
            <numerusform>%n Gerät wird fehlschlagen: sein Konto ist vorübergehend gesperrt.</numerusform>
            <numerusform>%n Geräte werden fehlschlagen: ihr Konto ist vorübergehend gesperrt.</numerusform>
        </translation>
    </message>
    <message>
        <source>Account blocked</source>
        <translation>Konto gesperrt</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) refused the last password; another wrong one may block the account.</source>
        <translation>
            <numerusform>%n Gerät hat das letzte Passwort abgelehnt; ein weiteres falsches kann das Konto sperren.</numerusform>
            <numerusform>%n Geräte haben das letzte Passwort abgelehnt; ein weiteres falsches kann das Konto sperren.</numerusform>
        </translation>
    </message>
    <message>
        <source>Invalid password</source>
        <translation>Ungültiges Passwort</translation>
    </message>
</context>
<context>
    <name>CPostWork</name>
    <message>
        <source>Reason: %1.</source>
        <translation>Grund: %1.</translation>
    </message>
    <message>
        <source>There will be no debug information in “%1”: the server does not know its task any more.</source>
        <translation>In „%1“ wird es keine Debug-Infos geben: der Server kennt ihre Aufgabe nicht mehr.</translation>
    </message>
    <message>
        <source>The debug information could not be saved in “%1”, which will be tried again. %2</source>
        <translation>Die Debug-Infos konnten nicht in „%1“ gespeichert werden; es wird erneut versucht. %2</translation>
    </message>
    <message>
        <source>There will be no debug information in “%1”: no device delivered any.</source>
        <translation>In „%1“ wird es keine Debug-Infos geben: Kein Gerät hat welche geliefert.</translation>
    </message>
</context>
<context>
    <name>CaFileField</name>
    <message>
        <source>This certificate has expired.</source>
        <translation>Dieses Zertifikat ist abgelaufen.</translation>
    </message>
    <message>
        <source>This certificate is not yet valid.</source>
        <translation>Dieses Zertifikat ist noch nicht gültig.</translation>
    </message>
    <message>
        <source>This certificate expires soon.</source>
        <translation>Dieses Zertifikat läuft bald ab.</translation>
    </message>
    <message>
        <source>This is no certificate of an authority.</source>
        <translation>Dies ist kein Zertifikat einer Zertifizierungsstelle.</translation>
    </message>
    <message>
        <source>Choose a file</source>
        <translation>Datei wählen</translation>
    </message>
    <message>
        <source>Choose a CA certificate</source>
        <translation>CA-Zertifikat wählen</translation>
    </message>
    <message>
        <source>There is no certificate in the file.</source>
        <translation>Die Datei enthält kein Zertifikat.</translation>
    </message>
    <message>
        <source>%1, valid from %2 to %3</source>
        <translation>%1, gültig von %2 bis %3</translation>
    </message>
    <message>
        <source>%1 %2</source>
        <translation>%1 %2</translation>
    </message>
</context>
<context>
    <name>CertificateBox</name>
    <message>
        <source>Select all/Deselect all</source>
        <translation>Alle auswählen/abwählen</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>Modell, IP oder MAC suchen</translation>
    </message>
    <message>
        <source>Choose files…</source>
        <translation>Dateien wählen…</translation>
    </message>
    <message>
        <source>Devices and their certificates</source>
        <translation>Geräte und ihre Zertifikate</translation>
    </message>
    <message>
        <source>Pick certificate…</source>
        <translation>Zertifikat wählen…</translation>
    </message>
    <message>
        <source>Pick private key…</source>
        <translation>Privaten Schlüssel wählen…</translation>
    </message>
    <message>
        <source>Remove files</source>
        <translation>Dateien entfernen</translation>
    </message>
    <message>
        <source>Choose files</source>
        <translation>Dateien wählen</translation>
    </message>
    <message>
        <source>Pick private key</source>
        <translation>Privaten Schlüssel wählen</translation>
    </message>
    <message>
        <source>Pick certificate</source>
        <translation>Zertifikat wählen</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>There is no private key in the file.</source>
        <translation>Die Datei enthält keinen privaten Schlüssel.</translation>
    </message>
    <message>
        <source>There is no certificate in the file.</source>
        <translation>Die Datei enthält kein Zertifikat.</translation>
    </message>
    <message numerus="yes">
        <source>%n file(s) left to read…</source>
        <translation>
            <numerusform>%n Datei wird noch gelesen…</numerusform>
            <numerusform>%n Dateien werden noch gelesen…</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n file(s) not used: %1</source>
        <translation>
            <numerusform>%n Datei nicht verwendet: %1</numerusform>
            <numerusform>%n Dateien nicht verwendet: %1</numerusform>
        </translation>
    </message>
    <message>
        <source>, </source>
        <translation>, </translation>
    </message>
    <message>
        <source>Files find their devices by the MAC addresses in their names. Drop them here, or select rows to pick by hand.</source>
        <translation>Dateien finden ihre Geräte über die MAC-Adressen in ihren Namen. Dateien hier ablegen oder Zeilen auswählen, um sie einzeln zu wählen.</translation>
    </message>
</context>
<context>
    <name>CertificateCheck</name>
    <message>
        <source>No MAC address of its own</source>
        <translation>Keine eigene MAC-Adresse</translation>
    </message>
    <message>
        <source>File of no use</source>
        <translation>Unbrauchbare Datei</translation>
    </message>
    <message>
        <source>No certificate</source>
        <translation>Kein Zertifikat</translation>
    </message>
    <message>
        <source>No private key</source>
        <translation>Kein privater Schlüssel</translation>
    </message>
    <message>
        <source>Encrypted key not supported</source>
        <translation>Verschlüsselter Schlüssel nicht unterstützt</translation>
    </message>
    <message>
        <source>Key not opened by the password</source>
        <translation>Passwort öffnet den Schlüssel nicht</translation>
    </message>
    <message>
        <source>Key of another certificate</source>
        <translation>Schlüssel eines anderen Zertifikats</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Abgelaufen</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would get an expired certificate.</source>
        <translation>
            <numerusform>%n Gerät würde ein abgelaufenes Zertifikat erhalten.</numerusform>
            <numerusform>%n Geräte würden ein abgelaufenes Zertifikat erhalten.</numerusform>
        </translation>
    </message>
    <message>
        <source>Not yet valid</source>
        <translation>Noch nicht gültig</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would get a certificate that is not yet valid.</source>
        <translation>
            <numerusform>%n Gerät würde ein noch nicht gültiges Zertifikat erhalten.</numerusform>
            <numerusform>%n Geräte würden ein noch nicht gültiges Zertifikat erhalten.</numerusform>
        </translation>
    </message>
    <message>
        <source>File with a private key</source>
        <translation>Datei mit privatem Schlüssel</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would get a file that holds a private key too.</source>
        <translation>
            <numerusform>%n Gerät würde eine Datei erhalten, die auch einen privaten Schlüssel enthält.</numerusform>
            <numerusform>%n Geräte würden eine Datei erhalten, die auch einen privaten Schlüssel enthält.</numerusform>
        </translation>
    </message>
    <message>
        <source>No key or request on the device</source>
        <translation>Kein Schlüssel und keine Anforderung auf dem Gerät</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: no private key or certificate request there to install a certificate for.</source>
        <translation>
            <numerusform>%n Gerät wird fehlschlagen: es hat weder einen privaten Schlüssel noch eine Zertifikatsanforderung.</numerusform>
            <numerusform>%n Geräte werden fehlschlagen: sie haben weder einen privaten Schlüssel noch eine Zertifikatsanforderung.</numerusform>
        </translation>
    </message>
    <message>
        <source>Expires soon</source>
        <translation>Läuft bald ab</translation>
    </message>
</context>
<context>
    <name>CertificateFiles</name>
    <message>
        <source>The file does not exist.</source>
        <translation>Die Datei ist nicht vorhanden.</translation>
    </message>
    <message>
        <source>It is a folder, not a file.</source>
        <translation>Es ist ein Ordner, keine Datei.</translation>
    </message>
    <message>
        <source>It is not a plain file.</source>
        <translation>Es ist keine gewöhnliche Datei.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Die Datei ist leer.</translation>
    </message>
    <message>
        <source>The file is larger than 1 MiB, which no certificate is.</source>
        <translation>Die Datei ist größer als 1 MiB; so groß ist kein Zertifikat.</translation>
    </message>
    <message>
        <source>The file cannot be read: %1.</source>
        <translation>Die Datei kann nicht gelesen werden: %1.</translation>
    </message>
    <message>
        <source>The file cannot be read.</source>
        <translation>Die Datei kann nicht gelesen werden.</translation>
    </message>
</context>
<context>
    <name>CertificateListModel</name>
    <message>
        <source>HTTPS</source>
        <translation>HTTPS</translation>
    </message>
    <message>
        <source>IEEE 802.1X</source>
        <translation>IEEE 802.1X</translation>
    </message>
    <message>
        <source>State</source>
        <translation>Zustand</translation>
    </message>
    <message>
        <source>Expires</source>
        <translation>Läuft ab</translation>
    </message>
    <message>
        <source>Use</source>
        <translation>Verwendung</translation>
    </message>
    <message>
        <source>Subject</source>
        <translation>Inhaber</translation>
    </message>
</context>
<context>
    <name>CertificateModel</name>
    <message>
        <source>%1, %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>, </source>
        <translation>, </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will be left out: %1.</source>
        <translation>
            <numerusform>%n Gerät wird ausgelassen: %1.</numerusform>
            <numerusform>%n Geräte werden ausgelassen: %1.</numerusform>
        </translation>
    </message>
    <message>
        <source>self-signed</source>
        <translation>selbst signiert</translation>
    </message>
    <message>
        <source>issued by %1</source>
        <translation>ausgestellt von %1</translation>
    </message>
    <message>
        <source>%1, %2, valid from %3 to %4</source>
        <translation>%1, %2, gültig von %3 bis %4</translation>
    </message>
    <message>
        <source>Model</source>
        <translation>Modell</translation>
    </message>
    <message>
        <source>IP</source>
        <translation>IP</translation>
    </message>
    <message>
        <source>MAC</source>
        <translation>MAC</translation>
    </message>
    <message>
        <source>Certificate</source>
        <translation>Zertifikat</translation>
    </message>
    <message>
        <source>Private Key</source>
        <translation>Privater Schlüssel</translation>
    </message>
    <message>
        <source>Valid until</source>
        <translation>Gültig bis</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Hinweis</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Key matches</source>
        <translation>Schlüssel passt</translation>
    </message>
    <message>
        <source>Ready</source>
        <translation>Bereit</translation>
    </message>
</context>
<context>
    <name>CertificateParser</name>
    <message>
        <source>The private key in the file is damaged or of an unknown kind.</source>
        <translation>Der private Schlüssel in der Datei ist beschädigt oder von unbekannter Art.</translation>
    </message>
    <message>
        <source>The file holds a request for a certificate, not a certificate.</source>
        <translation>Die Datei enthält eine Zertifikatsanforderung, kein Zertifikat.</translation>
    </message>
    <message>
        <source>The file holds a public key only.</source>
        <translation>Die Datei enthält nur einen öffentlichen Schlüssel.</translation>
    </message>
    <message>
        <source>The file holds neither a certificate nor a private key.</source>
        <translation>Die Datei enthält weder ein Zertifikat noch einen privaten Schlüssel.</translation>
    </message>
    <message>
        <source>A certificate in the file is damaged.</source>
        <translation>Ein Zertifikat in der Datei ist beschädigt.</translation>
    </message>
    <message>
        <source>The file is damaged or cut off.</source>
        <translation>Die Datei ist beschädigt oder abgeschnitten.</translation>
    </message>
    <message>
        <source>The file holds neither a certificate nor a private key in PEM or DER form.</source>
        <translation>Die Datei enthält weder ein Zertifikat noch einen privaten Schlüssel im PEM- oder DER-Format.</translation>
    </message>
    <message>
        <source>The private key in the file is larger than any in use, or made to take too long to open.</source>
        <translation>Der private Schlüssel in der Datei ist größer als jeder gebräuchliche, oder sein Öffnen soll zu lange dauern.</translation>
    </message>
</context>
<context>
    <name>CertificatePaths</name>
    <message>
        <source>Certificates and keys</source>
        <translation>Zertifikate und Schlüssel</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>Alle Dateien</translation>
    </message>
</context>
<context>
    <name>CertificateUploadDialog</name>
    <message>
        <source>Certificates in use</source>
        <translation>Verwendete Zertifikate</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>%1 of %2 devices will be served</source>
        <translation>%1 von %2 Geräten werden bedient</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>Das Hochladen konnte nicht gestartet werden.</translation>
    </message>
</context>
<context>
    <name>CertificateValidities</name>
    <message>
        <source>Unknown</source>
        <translation>Unbekannt</translation>
    </message>
    <message>
        <source>Not yet valid</source>
        <translation>Noch nicht gültig</translation>
    </message>
    <message>
        <source>Expires soon</source>
        <translation>Läuft bald ab</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>Abgelaufen</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>Gültig</translation>
    </message>
</context>
<context>
    <name>CertificatesDialog</name>
    <message>
        <source>Certificates in use</source>
        <translation>Verwendete Zertifikate</translation>
    </message>
    <message>
        <source>Reading the certificates…</source>
        <translation>Zertifikate werden gelesen…</translation>
    </message>
    <message>
        <source>The certificates could not be read.</source>
        <translation>Die Zertifikate konnten nicht gelesen werden.</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Search device or subject</source>
        <translation>Gerät oder Inhaber suchen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>No device works with a certificate.</source>
        <translation>Kein Gerät arbeitet mit einem Zertifikat.</translation>
    </message>
    <message>
        <source>No certificate matches the search.</source>
        <translation>Kein Zertifikat passt zur Suche.</translation>
    </message>
    <message>
        <source>%1 expired, %2 within %3 days</source>
        <translation>%1 abgelaufen, %2 innerhalb von %3 Tagen</translation>
    </message>
    <message>
        <source>%1 of %2 certificates</source>
        <translation>%1 von %2 Zertifikaten</translation>
    </message>
</context>
<context>
    <name>ConfirmDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation>Remoteverbindung</translation>
    </message>
    <message>
        <source>Are you sure you want to connect to another server? The present session ends.</source>
        <translation>Wirklich mit einem anderen Server verbinden? Die aktuelle Sitzung wird beendet.</translation>
    </message>
    <message>
        <source>Connect</source>
        <translation>Verbinden</translation>
    </message>
    <message>
        <source>Unfinished Task</source>
        <translation>Unerledigte Aufgabe</translation>
    </message>
    <message>
        <source>A task was requested and has not begun yet. It may fail when the session ends now. Are you sure you want to go on?</source>
        <translation>Eine Aufgabe wurde angefordert und hat noch nicht begonnen. Sie kann fehlschlagen, wenn die Sitzung jetzt endet. Wirklich fortfahren?</translation>
    </message>
    <message>
        <source>End session</source>
        <translation>Sitzung beenden</translation>
    </message>
    <message>
        <source>Site Changes</source>
        <translation>Standortänderungen</translation>
    </message>
    <message>
        <source>There are unsaved/unapplied changes of sites, which are lost when the session ends now. Are you sure you want to go on?</source>
        <translation>Es gibt nicht gespeicherte oder nicht übernommene Änderungen an Standorten, die verloren gehen, wenn die Sitzung jetzt endet. Wirklich fortfahren?</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>There are settings that were changed and not applied. The changes are lost when the session ends now. Are you sure you want to go on?</source>
        <translation>Es gibt Einstellungen, die geändert und nicht übernommen wurden. Die Änderungen gehen verloren, wenn die Sitzung jetzt endet. Wirklich fortfahren?</translation>
    </message>
    <message>
        <source>Unsaved Changes</source>
        <translation>Nicht gespeicherte Änderungen</translation>
    </message>
    <message>
        <source>There are unsaved/unapplied changes on this page, which are lost when you leave it. Do you want to stay?</source>
        <translation>Auf dieser Seite gibt es nicht gespeicherte oder nicht übernommene Änderungen, die beim Verlassen verloren gehen. Auf der Seite bleiben?</translation>
    </message>
    <message>
        <source>Stay</source>
        <translation>Bleiben</translation>
    </message>
    <message>
        <source>Cancel Task</source>
        <translation>Aufgabe abbrechen</translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to cancel %n task(s)? Devices that are done already stay as they are.</source>
        <translation>
            <numerusform>%n Aufgabe wirklich abbrechen? Bereits fertige Geräte bleiben, wie sie sind.</numerusform>
            <numerusform>%n Aufgaben wirklich abbrechen? Bereits fertige Geräte bleiben, wie sie sind.</numerusform>
        </translation>
    </message>
    <message>
        <source>Cancel task</source>
        <translation>Aufgabe abbrechen</translation>
    </message>
    <message>
        <source>Remove Finished Tasks</source>
        <translation>Abgeschlossene Aufgaben entfernen</translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to remove %n finished task(s) from the list, with their results? This action cannot be undone.</source>
        <translation>
            <numerusform>%n abgeschlossene Aufgabe mit ihren Ergebnissen wirklich aus der Liste entfernen? Das kann nicht rückgängig gemacht werden.</numerusform>
            <numerusform>%n abgeschlossene Aufgaben mit ihren Ergebnissen wirklich aus der Liste entfernen? Das kann nicht rückgängig gemacht werden.</numerusform>
        </translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Entfernen</translation>
    </message>
    <message>
        <source>Delete Alarms</source>
        <translation>Alarme löschen</translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to delete %n alarm(s)? This action cannot be undone.</source>
        <translation>
            <numerusform>%n Alarm wirklich löschen? Das kann nicht rückgängig gemacht werden.</numerusform>
            <numerusform>%n Alarme wirklich löschen? Das kann nicht rückgängig gemacht werden.</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Delete Device(s) from Device Overview</source>
        <translation>Gerät(e) aus der Geräteübersicht löschen</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the selected device(s) from the system permanently? This action cannot be undone.</source>
        <translation>Die ausgewählten Geräte wirklich endgültig aus dem System löschen? Das kann nicht rückgängig gemacht werden.</translation>
    </message>
    <message>
        <source>Delete Device(s) from Site</source>
        <translation>Gerät(e) vom Standort löschen</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the copy of selected device(s) from this site? This action will not affect the list of Device Overview.</source>
        <translation>Die Kopie der ausgewählten Geräte wirklich von diesem Standort löschen? Die Liste der Geräteübersicht bleibt unverändert.</translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation>Gerät neu starten</translation>
    </message>
    <message>
        <source>Are you sure you want to restart device? This operation may take some time.</source>
        <translation>Das Gerät wirklich neu starten? Das kann einige Zeit dauern.</translation>
    </message>
    <message>
        <source>Restart</source>
        <translation>Neu starten</translation>
    </message>
    <message>
        <source>Delete Site</source>
        <translation>Standort löschen</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the site? This action will also delete the sub-site(s) and the copy of selected device(s) of each site and sub-site.</source>
        <translation>Den Standort wirklich löschen? Auch seine Unterstandorte und die Kopien der ausgewählten Geräte an diesen Standorten werden gelöscht.</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell-Dienstverwaltung</translation>
    </message>
    <message>
        <source>Are you sure you want to disconnect from this service?</source>
        <translation>Die Verbindung zu diesem Dienst wirklich trennen?</translation>
    </message>
    <message>
        <source>Disconnecting will stop the synchronization of all devices managed by this Device Manager. You will need to set up the connection again to restore synchronization.</source>
        <translation>Mit dem Trennen endet die Synchronisierung aller Geräte, die dieser Device Manager verwaltet. Um sie wieder aufzunehmen, muss die Verbindung neu eingerichtet werden.</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>Trennen</translation>
    </message>
    <message>
        <source>Keep running</source>
        <translation>Weiterlaufen lassen</translation>
    </message>
    <message>
        <source>Discard changes</source>
        <translation>Änderungen verwerfen</translation>
    </message>
</context>
<context>
    <name>CrashDialog</name>
    <message>
        <source>Unexpected End</source>
        <translation>Unerwartetes Ende</translation>
    </message>
    <message>
        <source>The program ended unexpectedly the last time. This report was saved; it may help your support to find out why. Passwords are left out of it.</source>
        <translation>Das Programm wurde beim letzten Mal unerwartet beendet. Dieser Bericht wurde gespeichert; er kann dem Support helfen, den Grund zu finden. Passwörter sind nicht darin.</translation>
    </message>
    <message>
        <source>Report</source>
        <translation>Bericht</translation>
    </message>
    <message>
        <source>Show folder</source>
        <translation>Ordner zeigen</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>CredentialRules</name>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Only alphanumeric characters are allowed.</source>
        <translation>Nur Buchstaben und Ziffern sind erlaubt.</translation>
    </message>
    <message>
        <source>Only alphanumeric characters and the following special characters !%-.@^_~ are allowed.</source>
        <translation>Nur Buchstaben, Ziffern und die Sonderzeichen !%-.@^_~ sind erlaubt.</translation>
    </message>
</context>
<context>
    <name>CsvDevices</name>
    <message>
        <source>The row is not UTF-8 text.</source>
        <translation>Die Zeile ist kein UTF-8-Text.</translation>
    </message>
    <message>
        <source>A quotation mark is not closed.</source>
        <translation>Ein Anführungszeichen ist nicht geschlossen.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no port from 1 to 65535.</source>
        <translation>„%1“ ist kein Port von 1 bis 65535.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no IPv4 address.</source>
        <translation>„%1“ ist keine IPv4-Adresse.</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no MAC address.</source>
        <translation>„%1“ ist keine MAC-Adresse.</translation>
    </message>
    <message>
        <source>The MAC address &quot;%1&quot; stands in line %2 already.</source>
        <translation>Die MAC-Adresse „%1“ steht bereits in Zeile %2.</translation>
    </message>
    <message>
        <source>it is larger than %1 MiB</source>
        <translation>sie ist größer als %1 MiB</translation>
    </message>
    <message>
        <source>it is no text file</source>
        <translation>es ist keine Textdatei</translation>
    </message>
    <message>
        <source>The first line is read as the header.</source>
        <translation>Die erste Zeile wird als Kopfzeile gelesen.</translation>
    </message>
    <message>
        <source>it is no file</source>
        <translation>es ist keine Datei</translation>
    </message>
    <message numerus="yes">
        <source>The row has %n column(s) in place of %1.</source>
        <translation>
            <numerusform>Die Zeile hat %n Spalte statt %1.</numerusform>
            <numerusform>Die Zeile hat %n Spalten statt %1.</numerusform>
        </translation>
    </message>
    <message>
        <source>The row is longer than %1 characters.</source>
        <translation>Die Zeile ist länger als %1 Zeichen.</translation>
    </message>
    <message>
        <source>it has more than %1 rows</source>
        <translation>sie hat mehr als %1 Zeilen</translation>
    </message>
</context>
<context>
    <name>DBusToasts</name>
    <message>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
</context>
<context>
    <name>DeviceActions</name>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>%1 of %2 devices are authorized.</source>
        <translation>%1 von %2 Geräten sind autorisiert.</translation>
    </message>
    <message>
        <source>%1 of %2 devices are authorized so far. %3.</source>
        <translation>%1 von %2 Geräten sind bisher autorisiert. %3.</translation>
    </message>
    <message>
        <source>Authorize Device</source>
        <translation>Gerät autorisieren</translation>
    </message>
    <message>
        <source>%1 failed: %2.</source>
        <translation>„%1“ ist fehlgeschlagen: %2.</translation>
    </message>
    <message numerus="yes">
        <source>The credentials are on their way to %n device(s).</source>
        <translation>
            <numerusform>Die Zugangsdaten sind unterwegs zu %n Gerät.</numerusform>
            <numerusform>Die Zugangsdaten sind unterwegs zu %n Geräten.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) deleted.</source>
        <translation>
            <numerusform>%n Gerät gelöscht.</numerusform>
            <numerusform>%n Geräte gelöscht.</numerusform>
        </translation>
    </message>
    <message>
        <source>Deleting devices</source>
        <translation>Geräte löschen</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) removed from the site.</source>
        <translation>
            <numerusform>%n Gerät vom Standort entfernt.</numerusform>
            <numerusform>%n Geräte vom Standort entfernt.</numerusform>
        </translation>
    </message>
    <message>
        <source>Removing devices from the site</source>
        <translation>Geräte vom Standort entfernen</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) moved.</source>
        <translation>
            <numerusform>%n Gerät verschoben.</numerusform>
            <numerusform>%n Geräte verschoben.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added to the site.</source>
        <translation>
            <numerusform>%n Gerät zum Standort hinzugefügt.</numerusform>
            <numerusform>%n Geräte zum Standort hinzugefügt.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) in the site already.</source>
        <translation>
            <numerusform>%n Gerät war schon am Standort.</numerusform>
            <numerusform>%n Geräte waren schon am Standort.</numerusform>
        </translation>
    </message>
    <message>
        <source>The devices are not managed any more.</source>
        <translation>Die Geräte werden nicht mehr verwaltet.</translation>
    </message>
    <message>
        <source>Putting devices into the site</source>
        <translation>Geräte dem Standort zuordnen</translation>
    </message>
    <message>
        <source>%1 failed: %2. Nothing was changed.</source>
        <translation>„%1“ ist fehlgeschlagen: %2. Nichts wurde geändert.</translation>
    </message>
    <message>
        <source>%1 may have failed: %2. Look at the list before you try again.</source>
        <translation>„%1“ ist vielleicht fehlgeschlagen: %2. Vor einem neuen Versuch bitte die Liste prüfen.</translation>
    </message>
    <message>
        <source>Exporting...</source>
        <translation>Wird exportiert ...</translation>
    </message>
    <message>
        <source>Exported successfully!</source>
        <translation>Erfolgreich exportiert!</translation>
    </message>
    <message>
        <source>The device list could not be exported: %1</source>
        <translation>Die Geräteliste konnte nicht exportiert werden: %1</translation>
    </message>
    <message>
        <source>The device list could not be exported.</source>
        <translation>Die Geräteliste konnte nicht exportiert werden.</translation>
    </message>
    <message>
        <source>%1 could not be started: %2.</source>
        <translation>„%1“ konnte nicht gestartet werden: %2.</translation>
    </message>
    <message>
        <source>%1 may have begun: %2. Look at its task before you try again.</source>
        <translation>%1 hat vielleicht begonnen: %2. Sehen Sie sich die Aufgabe an, bevor Sie es erneut versuchen.</translation>
    </message>
    <message numerus="yes">
        <source>Left out: %n device(s) that the server does not manage any more.</source>
        <translation>
            <numerusform>%n Gerät wurde ausgelassen: der Server verwaltet es nicht mehr.</numerusform>
            <numerusform>%n Geräte wurden ausgelassen: der Server verwaltet sie nicht mehr.</numerusform>
        </translation>
    </message>
    <message>
        <source>The server has ended the session.</source>
        <translation>Der Server hat die Sitzung beendet.</translation>
    </message>
</context>
<context>
    <name>DeviceFooter</name>
    <message>
        <source>Show only these</source>
        <translation>Nur diese anzeigen</translation>
    </message>
    <message numerus="yes">
        <source>%1 of %Ln device(s) selected</source>
        <translation>
            <numerusform>%1 von %Ln Gerät ausgewählt</numerusform>
            <numerusform>%1 von %Ln Geräten ausgewählt</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 of %2 shown selected, %Ln device(s) in all</source>
        <translation>
            <numerusform>%1 von %2 angezeigten ausgewählt, %Ln Gerät insgesamt</numerusform>
            <numerusform>%1 von %2 angezeigten ausgewählt, %Ln Geräte insgesamt</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 authorized</source>
        <translation>%1 autorisiert</translation>
    </message>
    <message>
        <source>%1 unreachable</source>
        <translation>%1 nicht erreichbar</translation>
    </message>
    <message>
        <source>%1 need attention</source>
        <translation>%1 zu prüfen</translation>
    </message>
    <message numerus="yes">
        <source>%n s</source>
        <translation>
            <numerusform>%n s</numerusform>
            <numerusform>%n s</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n min</source>
        <translation>
            <numerusform>%n min</numerusform>
            <numerusform>%n min</numerusform>
        </translation>
    </message>
    <message>
        <source>Not updated for %1</source>
        <translation>Seit %1 nicht aktualisiert</translation>
    </message>
    <message>
        <source>Updated just now</source>
        <translation>Gerade aktualisiert</translation>
    </message>
    <message>
        <source>Updated %1 ago</source>
        <translation>Vor %1 aktualisiert</translation>
    </message>
</context>
<context>
    <name>DeviceMenus</name>
    <message>
        <source>Copy cell</source>
        <translation>Zelle kopieren</translation>
    </message>
    <message>
        <source>Copy rows</source>
        <translation>Zeilen kopieren</translation>
    </message>
</context>
<context>
    <name>DeviceRecords</name>
    <message>
        <source>Enabled</source>
        <translation>Aktiviert</translation>
    </message>
    <message>
        <source>Disabled</source>
        <translation>Deaktiviert</translation>
    </message>
    <message>
        <source>Ready</source>
        <translation>Bereit</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Detached</source>
        <translation>Nicht eingesetzt</translation>
    </message>
    <message>
        <source>Empty</source>
        <translation>Leer</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>Stumm</translation>
    </message>
    <message>
        <source>Unmute</source>
        <translation>Nicht stumm</translation>
    </message>
    <message>
        <source>Status</source>
        <translation>Status</translation>
    </message>
    <message>
        <source>Model</source>
        <translation>Modell</translation>
    </message>
    <message>
        <source>Host Name</source>
        <translation>Hostname</translation>
    </message>
    <message>
        <source>IP</source>
        <translation>IP</translation>
    </message>
    <message>
        <source>MAC</source>
        <translation>MAC</translation>
    </message>
    <message>
        <source>Firmware</source>
        <translation>Firmware</translation>
    </message>
    <message>
        <source>HTTP Port</source>
        <translation>HTTP-Port</translation>
    </message>
    <message>
        <source>HTTPS Port</source>
        <translation>HTTPS-Port</translation>
    </message>
    <message>
        <source>HTTPS</source>
        <translation>HTTPS</translation>
    </message>
    <message>
        <source>IEEE 802.1X</source>
        <translation>IEEE 802.1X</translation>
    </message>
    <message>
        <source>SD Card Status</source>
        <translation>SD-Karte</translation>
    </message>
    <message>
        <source>SD Card Usage(%)</source>
        <translation>SD-Kartenbelegung (%)</translation>
    </message>
    <message>
        <source>Date/Time</source>
        <translation>Datum/Uhrzeit</translation>
    </message>
    <message>
        <source>Power Frequency(Hz)</source>
        <translation>Netzfrequenz (Hz)</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Audio</translation>
    </message>
</context>
<context>
    <name>DeviceStatus</name>
    <message>
        <source>Unauthorized</source>
        <translation>Nicht autorisiert</translation>
    </message>
    <message>
        <source>Access Denied</source>
        <translation>Zugriff verweigert</translation>
    </message>
    <message>
        <source>Authorized</source>
        <translation>Autorisiert</translation>
    </message>
    <message>
        <source>Unreachable</source>
        <translation>Nicht erreichbar</translation>
    </message>
    <message>
        <source>Maintaining...</source>
        <translation>Wartung läuft ...</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>Passwort festlegen</translation>
    </message>
    <message>
        <source>Invalid Password</source>
        <translation>Ungültiges Passwort</translation>
    </message>
    <message>
        <source>Account Blocked</source>
        <translation>Konto gesperrt</translation>
    </message>
</context>
<context>
    <name>DeviceTab</name>
    <message>
        <source>Drag devices from the &quot;Device Overview&quot;</source>
        <translation>Geräte aus der „Geräteübersicht“ hierher ziehen</translation>
    </message>
    <message>
        <source>Add Device</source>
        <translation>Gerät hinzufügen</translation>
    </message>
    <message>
        <source>No Device</source>
        <translation>Kein Gerät</translation>
    </message>
    <message>
        <source>Clear filter</source>
        <translation>Filter aufheben</translation>
    </message>
    <message>
        <source>No device matches</source>
        <translation>Kein Gerät passt</translation>
    </message>
    <message>
        <source>Search and status chips leave no device of this tab.</source>
        <translation>Suche und Statusfilter lassen kein Gerät dieses Reiters übrig.</translation>
    </message>
    <message>
        <source>Loading devices...</source>
        <translation>Geräte werden geladen ...</translation>
    </message>
    <message>
        <source>The device list could not be read</source>
        <translation>Die Geräteliste konnte nicht gelesen werden</translation>
    </message>
    <message>
        <source>It is read again as soon as the server answers.</source>
        <translation>Sie wird wieder gelesen, sobald der Server antwortet.</translation>
    </message>
</context>
<context>
    <name>DeviceTabs</name>
    <message>
        <source>Camera</source>
        <translation>Kamera</translation>
    </message>
    <message>
        <source>NVR</source>
        <translation>NVR</translation>
    </message>
    <message>
        <source>Others</source>
        <translation>Sonstige</translation>
    </message>
</context>
<context>
    <name>DeviceTabsCorner</name>
    <message>
        <source>Search devices</source>
        <translation>Geräte suchen</translation>
    </message>
    <message>
        <source>Model, host name, firmware or site; an IP address, network (10.4.0.0/16) or range (10.4.0.10-20); a MAC address</source>
        <translation>Modell, Hostname, Firmware oder Standort; eine IP-Adresse, ein Netz (10.4.0.0/16) oder ein Bereich (10.4.0.10-20); eine MAC-Adresse</translation>
    </message>
    <message>
        <source>Remote connection</source>
        <translation>Remoteverbindung</translation>
    </message>
    <message>
        <source>Columns</source>
        <translation>Spalten</translation>
    </message>
</context>
<context>
    <name>DeviceWindow</name>
    <message>
        <source>The devices are not managed any more.</source>
        <translation>Die Geräte werden nicht mehr verwaltet.</translation>
    </message>
    <message>
        <source>The device is not managed any more.</source>
        <translation>Das Gerät wird nicht mehr verwaltet.</translation>
    </message>
    <message>
        <source>The device cannot be shown.</source>
        <translation>Das Gerät kann nicht angezeigt werden.</translation>
    </message>
</context>
<context>
    <name>DiscoveredModel</name>
    <message>
        <source>Discovered</source>
        <translation>Im Netzwerk gefunden</translation>
    </message>
    <message>
        <source>Found by IP</source>
        <translation>Nach IP gefunden</translation>
    </message>
    <message>
        <source>From file</source>
        <translation>Aus Datei</translation>
    </message>
</context>
<context>
    <name>EditServerDialog</name>
    <message>
        <source>Edit Server</source>
        <translation>Server bearbeiten</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
</context>
<context>
    <name>ExportDebugInfoDialog</name>
    <message>
        <source>Export Debug Info</source>
        <translation>Debug-Infos exportieren</translation>
    </message>
    <message>
        <source>Folder on this computer</source>
        <translation>Ordner auf diesem Computer</translation>
    </message>
    <message>
        <source>Choose Folder</source>
        <translation>Ordner wählen</translation>
    </message>
    <message>
        <source>The devices collect the information first. The report is saved when they are done, also if the program is started again meanwhile.</source>
        <translation>Die Geräte sammeln die Informationen zuerst. Der Bericht wird gespeichert, wenn sie fertig sind, auch wenn das Programm inzwischen neu gestartet wird.</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Exportieren</translation>
    </message>
    <message>
        <source>The export could not be started.</source>
        <translation>Der Export konnte nicht gestartet werden.</translation>
    </message>
</context>
<context>
    <name>FailedSubmission</name>
    <message numerus="yes">
        <source>%1 on %n device(s) did not begin. %2</source>
        <translation>
            <numerusform>„%1“ hat auf %n Gerät nicht begonnen. %2</numerusform>
            <numerusform>„%1“ hat auf %n Geräten nicht begonnen. %2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 on %n device(s) may have begun. %2</source>
        <translation>
            <numerusform>„%1“ hat auf %n Gerät vielleicht begonnen. %2</numerusform>
            <numerusform>„%1“ hat auf %n Geräten vielleicht begonnen. %2</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 Look at the devices before you try again.</source>
        <translation>%1 Sehen Sie sich die Geräte an, bevor Sie es erneut versuchen.</translation>
    </message>
    <message>
        <source>%1 Its task in the list tells whether it has.</source>
        <translation>%1 Ob es so ist, zeigt die Aufgabe in der Liste.</translation>
    </message>
    <message>
        <source>%1 did not begin. %2</source>
        <translation>„%1“ hat nicht begonnen. %2</translation>
    </message>
    <message>
        <source>%1 may have begun. %2</source>
        <translation>„%1“ hat vielleicht begonnen. %2</translation>
    </message>
</context>
<context>
    <name>FailedTaskBanner</name>
    <message>
        <source>Start again</source>
        <translation>Erneut starten</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>Ausblenden</translation>
    </message>
    <message>
        <source>1 of %1</source>
        <translation>1 von %1</translation>
    </message>
</context>
<context>
    <name>FileCheck</name>
    <message>
        <source>There is no such file.</source>
        <translation>Die Datei ist nicht vorhanden.</translation>
    </message>
    <message>
        <source>This is a folder.</source>
        <translation>Dies ist ein Ordner.</translation>
    </message>
    <message>
        <source>This is no plain file.</source>
        <translation>Dies ist keine gewöhnliche Datei.</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>Die Datei ist leer.</translation>
    </message>
    <message>
        <source>The file cannot be read.</source>
        <translation>Die Datei kann nicht gelesen werden.</translation>
    </message>
    <message>
        <source>There is no such folder.</source>
        <translation>Der Ordner ist nicht vorhanden.</translation>
    </message>
    <message>
        <source>This is no folder.</source>
        <translation>Dies ist kein Ordner.</translation>
    </message>
    <message>
        <source>Nothing can be written to this folder.</source>
        <translation>In diesen Ordner kann nichts geschrieben werden.</translation>
    </message>
    <message>
        <source>The name of the file is damaged; give it another one.</source>
        <translation>Der Name der Datei ist beschädigt; bitte einen anderen vergeben.</translation>
    </message>
    <message>
        <source>The name of the file is blank; give it another one.</source>
        <translation>Der Name der Datei ist leer; bitte einen anderen vergeben.</translation>
    </message>
    <message>
        <source>The file has %1; the server takes %2 at most.</source>
        <translation>Die Datei hat %1; der Server nimmt höchstens %2 an.</translation>
    </message>
</context>
<context>
    <name>FileField</name>
    <message>
        <source>Drop a file here or browse for it</source>
        <translation>Eine Datei hier ablegen oder nach ihr suchen</translation>
    </message>
    <message>
        <source>Drop a folder here or browse for it</source>
        <translation>Einen Ordner hier ablegen oder nach ihm suchen</translation>
    </message>
    <message>
        <source>Only one file can be taken.</source>
        <translation>Nur eine Datei ist möglich.</translation>
    </message>
    <message>
        <source>Only one folder can be taken.</source>
        <translation>Nur ein Ordner ist möglich.</translation>
    </message>
    <message>
        <source>Looking at it...</source>
        <translation>Wird geprüft ...</translation>
    </message>
    <message>
        <source>Size: %1</source>
        <translation>Größe: %1</translation>
    </message>
    <message>
        <source>Free: %1</source>
        <translation>Frei: %1</translation>
    </message>
    <message>
        <source>All Files(*)</source>
        <translation>Alle Dateien(*)</translation>
    </message>
    <message>
        <source>It could not be looked at; choose it again.</source>
        <translation>Die Auswahl konnte nicht geprüft werden; bitte erneut auswählen.</translation>
    </message>
</context>
<context>
    <name>FramelessDialog</name>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>FramelessWindow</name>
    <message>
        <source>Session Timeout</source>
        <translation>Sitzung abgelaufen</translation>
    </message>
    <message>
        <source>The user guide cannot be opened. It is installed with the program.</source>
        <translation>Das Benutzerhandbuch kann nicht geöffnet werden. Es wird mit dem Programm installiert.</translation>
    </message>
    <message>
        <source>The key of the service on this computer is remembered from now on: %1</source>
        <translation>Der Schlüssel des Dienstes auf diesem Computer ist von nun an gemerkt: %1</translation>
    </message>
    <message>
        <source>The key of the server %1 is remembered from now on: %2</source>
        <translation>Der Schlüssel des Servers %1 ist von nun an gemerkt: %2</translation>
    </message>
    <message>
        <source>The new key is not trusted. Nothing is sent to the server.</source>
        <translation>Dem neuen Schlüssel wird nicht vertraut. Es wird nichts an den Server gesendet.</translation>
    </message>
    <message>
        <source>You are logged in, but what you entered could not be saved for the next login. Look at whether the disk is full.</source>
        <translation>Sie sind angemeldet, aber Ihre Eingaben konnten nicht für die nächste Anmeldung gespeichert werden. Prüfen Sie, ob der Datenträger voll ist.</translation>
    </message>
</context>
<context>
    <name>InvalidDeviceDialog</name>
    <message>
        <source>Devices that could not be added</source>
        <translation>Geräte, die nicht hinzugefügt werden konnten</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Invalid Devices</source>
        <translation>Ungültige Geräte</translation>
    </message>
    <message>
        <source>Device</source>
        <translation>Gerät</translation>
    </message>
    <message>
        <source>Reason</source>
        <translation>Grund</translation>
    </message>
</context>
<context>
    <name>IpAssignment</name>
    <message numerus="yes">
        <source>Addresses given twice: %n device(s).</source>
        <translation>
            <numerusform>Doppelt vergebene Adressen: %n Gerät.</numerusform>
            <numerusform>Doppelt vergebene Adressen: %n Geräte.</numerusform>
        </translation>
    </message>
    <message>
        <source>Address given twice</source>
        <translation>Adresse doppelt vergeben</translation>
    </message>
    <message numerus="yes">
        <source>Addresses of other devices: %n.</source>
        <translation>
            <numerusform>Adressen anderer Geräte: %n.</numerusform>
            <numerusform>Adressen anderer Geräte: %n.</numerusform>
        </translation>
    </message>
    <message>
        <source>Address in use</source>
        <translation>Adresse belegt</translation>
    </message>
    <message numerus="yes">
        <source>Network, broadcast, gateway or reserved addresses: %n.</source>
        <translation>
            <numerusform>Netz-, Broadcast-, Gateway- oder reservierte Adressen: %n.</numerusform>
            <numerusform>Netz-, Broadcast-, Gateway- oder reservierte Adressen: %n.</numerusform>
        </translation>
    </message>
    <message>
        <source>No device address</source>
        <translation>Keine Geräteadresse</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would not reach the gateway: it is in another subnet.</source>
        <translation>
            <numerusform>%n Gerät würde das Gateway nicht erreichen: es liegt in einem anderen Subnetz.</numerusform>
            <numerusform>%n Geräte würden das Gateway nicht erreichen: es liegt in einem anderen Subnetz.</numerusform>
        </translation>
    </message>
    <message>
        <source>Gateway in another subnet</source>
        <translation>Gateway in anderem Subnetz</translation>
    </message>
</context>
<context>
    <name>JobOutcome</name>
    <message>
        <source>the client is busy, try again</source>
        <translation>der Client ist beschäftigt, bitte erneut versuchen</translation>
    </message>
    <message>
        <source>something went wrong in the client, its log says what</source>
        <translation>im Client ist ein Fehler aufgetreten, Näheres steht in seinem Protokoll</translation>
    </message>
    <message>
        <source>the session has ended</source>
        <translation>die Sitzung ist beendet</translation>
    </message>
</context>
<context>
    <name>ListActions</name>
    <message>
        <source>The task could not be cancelled: %1.</source>
        <translation>Die Aufgabe konnte nicht abgebrochen werden: %1.</translation>
    </message>
    <message>
        <source>The tasks could not be removed: %1.</source>
        <translation>Die Aufgaben konnten nicht entfernt werden: %1.</translation>
    </message>
    <message>
        <source>The alarms could not be deleted: %1.</source>
        <translation>Die Alarme konnten nicht gelöscht werden: %1.</translation>
    </message>
</context>
<context>
    <name>LocalNotices</name>
    <message>
        <source>The file %1 was damaged. What could be read of it was kept, and the damaged file is now called %2. Saved servers and settings may be missing.</source>
        <translation>Die Datei %1 war beschädigt. Was noch lesbar war, wurde behalten, und die beschädigte Datei heißt jetzt %2. Gespeicherte Server und Einstellungen können fehlen.</translation>
    </message>
    <message>
        <source>The file %1 is damaged and could not be repaired. Saved servers and settings may be missing, and changes of them are not kept.</source>
        <translation>Die Datei %1 ist beschädigt und konnte nicht repariert werden. Gespeicherte Server und Einstellungen können fehlen, und Änderungen daran werden nicht behalten.</translation>
    </message>
    <message>
        <source>The file %1 cannot be read. Saved servers and settings may be missing.</source>
        <translation>Die Datei %1 kann nicht gelesen werden. Gespeicherte Server und Einstellungen können fehlen.</translation>
    </message>
    <message>
        <source>The file %1 cannot be written; the disk may be full. What is saved there is used, but changes are not kept.</source>
        <translation>Die Datei %1 kann nicht geschrieben werden; vielleicht ist der Datenträger voll. Was darin gespeichert ist, wird verwendet, aber Änderungen werden nicht behalten.</translation>
    </message>
    <message>
        <source>There is no key file of your own. Passwords are ciphered with a key that every copy of this program has. The user guide says what that means, and how a key file is made.</source>
        <translation>Es gibt keine eigene Schlüsseldatei. Passwörter werden mit einem Schlüssel chiffriert, den jede Kopie dieses Programms hat. Das Benutzerhandbuch sagt, was das bedeutet und wie eine Schlüsseldatei erstellt wird.</translation>
    </message>
</context>
<context>
    <name>LogChart</name>
    <message>
        <source>Log entries over time</source>
        <translation>Protokolleinträge im Zeitverlauf</translation>
    </message>
    <message>
        <source>%1 to %2</source>
        <translation>%1 bis %2</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>no entries</source>
        <translation>keine Einträge</translation>
    </message>
</context>
<context>
    <name>LogPager</name>
    <message>
        <source>Results per page</source>
        <translation>Ergebnisse je Seite</translation>
    </message>
    <message>
        <source>First page</source>
        <translation>Erste Seite</translation>
    </message>
    <message>
        <source>Previous page</source>
        <translation>Vorherige Seite</translation>
    </message>
    <message>
        <source>Next page</source>
        <translation>Nächste Seite</translation>
    </message>
    <message>
        <source>Last page</source>
        <translation>Letzte Seite</translation>
    </message>
    <message>
        <source>0 of 0</source>
        <translation>0 von 0</translation>
    </message>
    <message>
        <source>%1 from %2</source>
        <translation>%1 von %2</translation>
    </message>
</context>
<context>
    <name>LogSidebar</name>
    <message>
        <source>Time Frame</source>
        <translation>Zeitraum</translation>
    </message>
    <message>
        <source>Start Time</source>
        <translation>Beginn</translation>
    </message>
    <message>
        <source>End Time</source>
        <translation>Ende</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>Quelle</translation>
    </message>
    <message>
        <source>All Sources</source>
        <translation>Alle Quellen</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Typ</translation>
    </message>
    <message>
        <source>All Types</source>
        <translation>Alle Typen</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Last hour</source>
        <translation>Letzte Stunde</translation>
    </message>
    <message>
        <source>Today</source>
        <translation>Heute</translation>
    </message>
    <message>
        <source>7 days</source>
        <translation>7 Tage</translation>
    </message>
    <message>
        <source>%1, date</source>
        <translation>%1, Datum</translation>
    </message>
    <message>
        <source>%1, time of day</source>
        <translation>%1, Uhrzeit</translation>
    </message>
</context>
<context>
    <name>LogTable</name>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Sort by %1</source>
        <translation>Nach %1 sortieren</translation>
    </message>
</context>
<context>
    <name>LogWindow</name>
    <message>
        <source>Date/Time</source>
        <translation>Datum/Uhrzeit</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>Quelle</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>Typ</translation>
    </message>
    <message>
        <source>User</source>
        <translation>Benutzer</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>Beschreibung</translation>
    </message>
    <message>
        <source>Device</source>
        <translation>Gerät</translation>
    </message>
    <message>
        <source>System</source>
        <translation>System</translation>
    </message>
    <message>
        <source>Alarm</source>
        <translation>Alarm</translation>
    </message>
    <message>
        <source>Event</source>
        <translation>Ereignis</translation>
    </message>
    <message>
        <source>Audit</source>
        <translation>Audit</translation>
    </message>
    <message>
        <source>Other</source>
        <translation>Sonstiges</translation>
    </message>
    <message>
        <source>Log</source>
        <translation>Protokoll</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Speichern unter</translation>
    </message>
    <message>
        <source>CSV files (*.csv)</source>
        <translation>CSV-Dateien (*.csv)</translation>
    </message>
    <message>
        <source>Show the whole time frame</source>
        <translation>Den ganzen Zeitraum anzeigen</translation>
    </message>
    <message>
        <source>Search in the result</source>
        <translation>Im Ergebnis suchen</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Exportieren</translation>
    </message>
    <message>
        <source>Log entries</source>
        <translation>Protokolleinträge</translation>
    </message>
    <message>
        <source>Description of the selected entry</source>
        <translation>Beschreibung des ausgewählten Eintrags</translation>
    </message>
    <message>
        <source>Select an entry to read its whole description.</source>
        <translation>Einen Eintrag auswählen, um seine ganze Beschreibung zu lesen.</translation>
    </message>
    <message>
        <source>Clear filters</source>
        <translation>Filter aufheben</translation>
    </message>
    <message>
        <source>Retry</source>
        <translation>Erneut versuchen</translation>
    </message>
    <message>
        <source>Loading the log...</source>
        <translation>Protokoll wird geladen ...</translation>
    </message>
    <message>
        <source>No log entry</source>
        <translation>Kein Protokolleintrag</translation>
    </message>
    <message>
        <source>The log has nothing of this time frame.</source>
        <translation>Das Protokoll enthält nichts aus diesem Zeitraum.</translation>
    </message>
    <message>
        <source>No log entry matches</source>
        <translation>Kein Protokolleintrag passt</translation>
    </message>
    <message>
        <source>The log could not be read</source>
        <translation>Das Protokoll konnte nicht gelesen werden</translation>
    </message>
    <message>
        <source>The time frame ends before it starts.</source>
        <translation>Der Zeitraum endet, bevor er beginnt.</translation>
    </message>
    <message>
        <source>Searching...</source>
        <translation>Suche läuft ...</translation>
    </message>
    <message>
        <source>%1 Log Found</source>
        <translation>%1 Protokolleintrag gefunden</translation>
    </message>
    <message>
        <source>%1 Logs Found</source>
        <translation>%1 Protokolleinträge gefunden</translation>
    </message>
    <message>
        <source>Exporting...</source>
        <translation>Wird exportiert ...</translation>
    </message>
    <message>
        <source>Exported successfully!</source>
        <translation>Erfolgreich exportiert!</translation>
    </message>
    <message>
        <source>Failed to export.</source>
        <translation>Der Export ist fehlgeschlagen.</translation>
    </message>
</context>
<context>
    <name>LoginDialog</name>
    <message>
        <source>This Computer</source>
        <translation>Dieser Computer</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-Mail</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>Remote Server</source>
        <translation>Remoteserver</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Server</translation>
    </message>
    <message>
        <source>Manage...</source>
        <translation>Verwalten ...</translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation>Remoteverbindung</translation>
    </message>
    <message>
        <source>Manage saved servers</source>
        <translation>Gespeicherte Server verwalten</translation>
    </message>
    <message>
        <source>Log in</source>
        <translation>Anmelden</translation>
    </message>
    <message>
        <source>Login</source>
        <translation>Anmeldung</translation>
    </message>
    <message>
        <source>IP:Port/Domain Name</source>
        <translation>IP:Port/Domainname</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Enter the server as an address or a name, with a port from 1 to 65535 behind a colon where it is not %1.</source>
        <translation>Den Server als Adresse oder Namen angeben, mit einem Port von 1 bis 65535 hinter einem Doppelpunkt, wenn er nicht %1 ist.</translation>
    </message>
    <message>
        <source>The login could not be carried out. Try again.</source>
        <translation>Die Anmeldung konnte nicht ausgeführt werden. Bitte erneut versuchen.</translation>
    </message>
    <message>
        <source>The server did not open a session. Try again.</source>
        <translation>Der Server hat keine Sitzung eröffnet. Bitte erneut versuchen.</translation>
    </message>
    <message>
        <source>Server full.</source>
        <translation>Server voll.</translation>
    </message>
    <message>
        <source>Incorrect email or password. Try again.</source>
        <translation>E-Mail oder Passwort falsch. Bitte erneut versuchen.</translation>
    </message>
    <message>
        <source>Logging in...</source>
        <translation>Anmeldung läuft ...</translation>
    </message>
    <message>
        <source>The key file %1 cannot be used. Correct or remove it, then try again.</source>
        <translation>Die Schlüsseldatei %1 kann nicht verwendet werden. Berichtigen oder entfernen Sie sie und versuchen Sie es erneut.</translation>
    </message>
    <message>
        <source>The server shows another key than before. Nothing was sent to it.</source>
        <translation>Der Server zeigt einen anderen Schlüssel als bisher. Es wurde nichts an ihn gesendet.</translation>
    </message>
</context>
<context>
    <name>MainConsoleMenu</name>
    <message>
        <source>All</source>
        <translation>Alle</translation>
    </message>
    <message>
        <source>Reset columns</source>
        <translation>Spalten zurücksetzen</translation>
    </message>
</context>
<context>
    <name>MainWindow</name>
    <message>
        <source>Device</source>
        <translation>Gerät</translation>
    </message>
    <message>
        <source>Logs</source>
        <translation>Protokolle</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>Einstellungen</translation>
    </message>
    <message>
        <source>Alarms</source>
        <translation>Alarme</translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation>Aufgaben</translation>
    </message>
    <message>
        <source>Debug information saved as “%1”.</source>
        <translation>Debug-Infos gespeichert als „%1“.</translation>
    </message>
</context>
<context>
    <name>ModelGroupModel</name>
    <message>
        <source>Model</source>
        <translation>Modell</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>Geräte</translation>
    </message>
    <message>
        <source>Present version</source>
        <translation>Jetzige Version</translation>
    </message>
    <message>
        <source>Image</source>
        <translation>Image</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 von %2</translation>
    </message>
    <message>
        <source>fits</source>
        <translation>passt</translation>
    </message>
    <message>
        <source>another model group</source>
        <translation>andere Modellgruppe</translation>
    </message>
    <message>
        <source>cannot be told, the device will judge</source>
        <translation>nicht erkennbar, das Gerät entscheidet</translation>
    </message>
</context>
<context>
    <name>NoticeBar</name>
    <message>
        <source>Site changes detected. Update changes to the server promptly by clicking</source>
        <translation>Standortänderungen erkannt. Änderungen bald auf den Server übertragen mit</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
</context>
<context>
    <name>NoticeCard</name>
    <message>
        <source>User Guide</source>
        <translation>Benutzerhandbuch</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>Notifier</name>
    <message>
        <source>Open</source>
        <translation>Öffnen</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>Ausblenden</translation>
    </message>
</context>
<context>
    <name>Operation</name>
    <message>
        <source>Add Device</source>
        <translation>Gerät hinzufügen</translation>
    </message>
    <message>
        <source>Authorize Device</source>
        <translation>Gerät autorisieren</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>Passwort festlegen</translation>
    </message>
    <message>
        <source>Assign IP Address</source>
        <translation>IP-Adresse zuweisen</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>Hochladen</translation>
    </message>
    <message>
        <source>Quick Setup</source>
        <translation>Schnelleinrichtung</translation>
    </message>
    <message>
        <source>Set Configuration</source>
        <translation>Konfiguration setzen</translation>
    </message>
    <message>
        <source>Backup Configuration</source>
        <translation>Konfiguration sichern</translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation>Gerät neu starten</translation>
    </message>
    <message>
        <source>Restore Device</source>
        <translation>Gerät zurücksetzen</translation>
    </message>
    <message>
        <source>Replace Device</source>
        <translation>Gerät ersetzen</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>Exportieren</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Aktualisieren</translation>
    </message>
    <message>
        <source>Delete Device</source>
        <translation>Gerät löschen</translation>
    </message>
    <message>
        <source>Export Device List</source>
        <translation>Geräteliste exportieren</translation>
    </message>
    <message>
        <source>Export Debug Info</source>
        <translation>Debug-Infos exportieren</translation>
    </message>
    <message>
        <source>Upload Firmware</source>
        <translation>Firmware hochladen</translation>
    </message>
    <message>
        <source>Upload Package</source>
        <translation>Paket hochladen</translation>
    </message>
    <message>
        <source>Upload Configuration File</source>
        <translation>Konfigurationsdatei hochladen</translation>
    </message>
    <message>
        <source>Upload Certificate</source>
        <translation>Zertifikat hochladen</translation>
    </message>
    <message>
        <source>HTTPS</source>
        <translation>HTTPS</translation>
    </message>
    <message>
        <source>IEEE 802.1x</source>
        <translation>IEEE 802.1x</translation>
    </message>
    <message>
        <source>Create Template</source>
        <translation>Vorlage erstellen</translation>
    </message>
    <message>
        <source>Import Template</source>
        <translation>Vorlage importieren</translation>
    </message>
    <message>
        <source>Restore to Restore Point</source>
        <translation>Auf Wiederherstellungspunkt zurücksetzen</translation>
    </message>
    <message>
        <source>Restore to Factory Default</source>
        <translation>Auf Werkseinstellungen zurücksetzen</translation>
    </message>
    <message>
        <source>More</source>
        <translation>Mehr</translation>
    </message>
    <message>
        <source>Certificates in use</source>
        <translation>Verwendete Zertifikate</translation>
    </message>
    <message>
        <source>Not available in this version yet.</source>
        <translation>In dieser Version noch nicht verfügbar.</translation>
    </message>
    <message>
        <source>Device List</source>
        <translation>Geräteliste</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>Speichern unter</translation>
    </message>
    <message>
        <source>CSV files (*.csv)</source>
        <translation>CSV-Dateien (*.csv)</translation>
    </message>
</context>
<context>
    <name>OperationDialog</name>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
</context>
<context>
    <name>OperationTargets</name>
    <message numerus="yes">
        <source>%n device(s) will fail: not reachable.</source>
        <translation>
            <numerusform>%n Gerät wird fehlschlagen: nicht erreichbar.</numerusform>
            <numerusform>%n Geräte werden fehlschlagen: nicht erreichbar.</numerusform>
        </translation>
    </message>
    <message>
        <source>Unreachable</source>
        <translation>Nicht erreichbar</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: not authorized.</source>
        <translation>
            <numerusform>%n Gerät wird fehlschlagen: nicht autorisiert.</numerusform>
            <numerusform>%n Geräte werden fehlschlagen: nicht autorisiert.</numerusform>
        </translation>
    </message>
    <message>
        <source>Not authorized</source>
        <translation>Nicht autorisiert</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) at work for another task.</source>
        <translation>
            <numerusform>%n Gerät ist mit einer anderen Aufgabe beschäftigt.</numerusform>
            <numerusform>%n Geräte sind mit einer anderen Aufgabe beschäftigt.</numerusform>
        </translation>
    </message>
    <message>
        <source>Busy</source>
        <translation>Beschäftigt</translation>
    </message>
</context>
<context>
    <name>OrbTexts</name>
    <message>
        <source>Norvell Partner Desk</source>
        <translation>Norvell Partner Desk</translation>
    </message>
    <message>
        <source>Unable to connect to this service. Check connection information, then retry.</source>
        <translation>Keine Verbindung zu diesem Dienst. Verbindungsdaten prüfen und erneut versuchen.</translation>
    </message>
    <message>
        <source>Oops! An unknown error happened. Try again or contact Norvell technical support for further assistance.</source>
        <translation>Ein unbekannter Fehler ist aufgetreten. Bitte erneut versuchen oder den technischen Support von Norvell um Hilfe bitten.</translation>
    </message>
    <message>
        <source>Incorrect email or password. Check account information via %1.</source>
        <translation>E-Mail oder Passwort falsch. Kontodaten im %1 prüfen.</translation>
    </message>
    <message>
        <source>Invalid password: Password reset required or password expired. Check account information via %1.</source>
        <translation>Ungültiges Passwort: Es muss zurückgesetzt werden oder ist abgelaufen. Kontodaten im %1 prüfen.</translation>
    </message>
    <message>
        <source>User does not exist. %1 via Norvell Partner Desk.</source>
        <translation>Der Benutzer ist nicht vorhanden. %1 im Norvell Partner Desk.</translation>
    </message>
    <message>
        <source>Become a Partner</source>
        <translation>Partner werden</translation>
    </message>
</context>
<context>
    <name>PasswordChecklist</name>
    <message>
        <source>The devices have no policy of their own.</source>
        <translation>Die Geräte haben keine eigene Richtlinie.</translation>
    </message>
</context>
<context>
    <name>PasswordEdit</name>
    <message>
        <source>Hide password</source>
        <translation>Passwort verbergen</translation>
    </message>
    <message>
        <source>Show password</source>
        <translation>Passwort anzeigen</translation>
    </message>
</context>
<context>
    <name>PasswordPolicy</name>
    <message>
        <source>At least one alphabetic character</source>
        <translation>Mindestens ein Buchstabe</translation>
    </message>
    <message>
        <source>At least one of these special characters: %1</source>
        <translation>Mindestens eines dieser Sonderzeichen: %1</translation>
    </message>
    <message>
        <source>At least one numeric character</source>
        <translation>Mindestens eine Ziffer</translation>
    </message>
    <message>
        <source>At least one lowercase character</source>
        <translation>Mindestens ein Kleinbuchstabe</translation>
    </message>
    <message>
        <source>At least one uppercase character</source>
        <translation>Mindestens ein Großbuchstabe</translation>
    </message>
    <message>
        <source>Not the same as the username</source>
        <translation>Nicht gleich dem Benutzernamen</translation>
    </message>
    <message numerus="yes">
        <source>At least %n character(s)</source>
        <translation>
            <numerusform>Mindestens %n Zeichen</numerusform>
            <numerusform>Mindestens %n Zeichen</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>PasswordPolicyDialog</name>
    <message>
        <source>Make your password policy with the following rules:</source>
        <translation>Passwortrichtlinie mit diesen Regeln festlegen:</translation>
    </message>
    <message>
        <source>Minimum required length:</source>
        <translation>Mindestlänge:</translation>
    </message>
    <message>
        <source>Minimum required length</source>
        <translation>Mindestlänge</translation>
    </message>
    <message>
        <source>At least one alphabetic character</source>
        <translation>Mindestens ein Buchstabe</translation>
    </message>
    <message>
        <source>At least one numeric character</source>
        <translation>Mindestens eine Ziffer</translation>
    </message>
    <message>
        <source>At least one of these special characters: !%-.@^_~ </source>
        <translation>Mindestens eines dieser Sonderzeichen: !%-.@^_~ </translation>
    </message>
    <message>
        <source>At least one uppercase character</source>
        <translation>Mindestens ein Großbuchstabe</translation>
    </message>
    <message>
        <source>At least one lowercase character</source>
        <translation>Mindestens ein Kleinbuchstabe</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>Password Policy</source>
        <translation>Passwortrichtlinie</translation>
    </message>
    <message>
        <source>Prohibition of a password that is the same as the</source>
        <translation>Kein Passwort, das gleich ist mit dem</translation>
    </message>
    <message>
        <source>username</source>
        <translation>Benutzernamen</translation>
    </message>
</context>
<context>
    <name>PathField</name>
    <message>
        <source>Browse...</source>
        <translation>Durchsuchen ...</translation>
    </message>
</context>
<context>
    <name>QueueBanners</name>
    <message numerus="yes">
        <source>Left out: %n device(s) that the server does not manage any more.</source>
        <translation>
            <numerusform>%n Gerät wurde ausgelassen: der Server verwaltet es nicht mehr.</numerusform>
            <numerusform>%n Geräte wurden ausgelassen: der Server verwaltet sie nicht mehr.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>QuickSetupDialog</name>
    <message>
        <source>Quick Setup</source>
        <translation>Schnelleinrichtung</translation>
    </message>
    <message>
        <source>Daylight saving</source>
        <translation>Sommerzeit</translation>
    </message>
    <message>
        <source>On</source>
        <translation>Ein</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>Aus</translation>
    </message>
    <message>
        <source>Mains frequency</source>
        <translation>Netzfrequenz</translation>
    </message>
    <message>
        <source>50 Hz</source>
        <translation>50 Hz</translation>
    </message>
    <message>
        <source>60 Hz</source>
        <translation>60 Hz</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>Audio</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>Stumm</translation>
    </message>
    <message>
        <source>Unmute</source>
        <translation>Nicht stumm</translation>
    </message>
    <message>
        <source>Only the settings that are ticked change.</source>
        <translation>Nur die angekreuzten Einstellungen ändern sich.</translation>
    </message>
    <message>
        <source>Time zone</source>
        <translation>Zeitzone</translation>
    </message>
    <message>
        <source>Date and time</source>
        <translation>Datum und Uhrzeit</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>As written below</source>
        <translation>Wie unten angegeben</translation>
    </message>
    <message>
        <source>Time zone as POSIX writes it</source>
        <translation>Zeitzone in POSIX-Schreibweise</translation>
    </message>
    <message>
        <source>This time zone has no daylight saving.</source>
        <translation>Diese Zeitzone hat keine Sommerzeit.</translation>
    </message>
    <message>
        <source>This is no time zone, as CET-1CEST,M3.5.0,M10.5.0/3 is one.</source>
        <translation>Das ist keine Zeitzone wie etwa CET-1CEST,M3.5.0,M10.5.0/3.</translation>
    </message>
    <message>
        <source>The setup could not be started.</source>
        <translation>Die Einrichtung konnte nicht gestartet werden.</translation>
    </message>
</context>
<context>
    <name>ReconnectingDialog</name>
    <message>
        <source>Unable to establish a connection to the server. The client is currently attempting to reconnect to the server.</source>
        <translation>Keine Verbindung zum Server. Der Client versucht gerade, die Verbindung wiederherzustellen.</translation>
    </message>
    <message>
        <source>Trying again every few seconds...</source>
        <translation>Alle paar Sekunden folgt ein neuer Versuch ...</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>Trennen</translation>
    </message>
    <message>
        <source>Reconnecting</source>
        <translation>Verbindung wird wiederhergestellt</translation>
    </message>
</context>
<context>
    <name>RefreshDeviceDialog</name>
    <message>
        <source>Refreshing...</source>
        <translation>Wird aktualisiert ...</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>Aktualisieren</translation>
    </message>
</context>
<context>
    <name>RemoteConnectionDialog</name>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Search name or information</source>
        <translation>Namen oder Adresse suchen</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Hinzufügen</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>Löschen</translation>
    </message>
    <message>
        <source>Saved servers</source>
        <translation>Gespeicherte Server</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation>Remoteverbindung</translation>
    </message>
    <message>
        <source>Server Name</source>
        <translation>Servername</translation>
    </message>
    <message>
        <source>Server Information</source>
        <translation>Serveradresse</translation>
    </message>
    <message>
        <source>The saved servers could not be read.</source>
        <translation>Die gespeicherten Server konnten nicht gelesen werden.</translation>
    </message>
    <message>
        <source>The list could not be saved; the saved one is as it was.</source>
        <translation>Die Liste konnte nicht gespeichert werden; die gespeicherte ist unverändert.</translation>
    </message>
    <message>
        <source>Key of the selected server</source>
        <translation>Schlüssel des ausgewählten Servers</translation>
    </message>
    <message>
        <source>Key Fingerprint</source>
        <translation>Fingerabdruck</translation>
    </message>
    <message>
        <source>First seen %1, last seen %2</source>
        <translation>Zuerst gesehen: %1, zuletzt gesehen: %2</translation>
    </message>
    <message>
        <source>The key of this server is remembered with the first login.</source>
        <translation>Der Schlüssel dieses Servers wird bei der ersten Anmeldung gemerkt.</translation>
    </message>
</context>
<context>
    <name>RestoreDeviceDialog</name>
    <message>
        <source>Network</source>
        <translation>Netzwerk</translation>
    </message>
    <message>
        <source>Daylight saving time</source>
        <translation>Sommerzeit</translation>
    </message>
    <message>
        <source>Custom language</source>
        <translation>Benutzerdefinierte Sprache</translation>
    </message>
    <message>
        <source>NADP</source>
        <translation>NADP</translation>
    </message>
    <message>
        <source>Focus position</source>
        <translation>Fokusposition</translation>
    </message>
    <message>
        <source>Lens configuration</source>
        <translation>Objektivkonfiguration</translation>
    </message>
    <message>
        <source>Restore to Factory Default</source>
        <translation>Auf Werkseinstellungen zurücksetzen</translation>
    </message>
    <message>
        <source>Restore all settings to factory default, including:</source>
        <translation>Alle Einstellungen auf Werkseinstellungen zurücksetzen, einschließlich:</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Zurücksetzen</translation>
    </message>
    <message>
        <source>Devices whose network settings are restored may get another address and be cut off from the server.</source>
        <translation>Geräte, deren Netzwerkeinstellungen zurückgesetzt werden, können eine andere Adresse erhalten und vom Server getrennt werden.</translation>
    </message>
    <message numerus="yes">
        <source>The settings of %n device(s) will be lost. Type %n to go on.</source>
        <translation>
            <numerusform>Die Einstellungen von %n Gerät gehen verloren. Zum Fortfahren %n eingeben.</numerusform>
            <numerusform>Die Einstellungen von %n Geräten gehen verloren. Zum Fortfahren %n eingeben.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>Rollout</name>
    <message>
        <source>The session ended before it began.</source>
        <translation>Die Sitzung war vor dem Beginn zu Ende.</translation>
    </message>
</context>
<context>
    <name>RolloutBannerRow</name>
    <message>
        <source>Continue</source>
        <translation>Fortsetzen</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>Anhalten</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>Ausblenden</translation>
    </message>
    <message>
        <source>Begin with the other devices now</source>
        <translation>Jetzt mit den übrigen Geräten beginnen</translation>
    </message>
    <message>
        <source>Do not begin with the other devices; those at work go on</source>
        <translation>Mit den übrigen Geräten nicht beginnen; begonnene laufen weiter</translation>
    </message>
</context>
<context>
    <name>RolloutFields</name>
    <message>
        <source>In waves:</source>
        <translation>In Wellen:</translation>
    </message>
    <message>
        <source>Size of the first wave</source>
        <translation>Größe der ersten Welle</translation>
    </message>
    <message>
        <source>What the first wave is counted in</source>
        <translation>Einheit der ersten Welle</translation>
    </message>
    <message>
        <source>devices</source>
        <translation>Geräte</translation>
    </message>
    <message>
        <source>%</source>
        <translation>%</translation>
    </message>
    <message>
        <source>Minutes between the waves</source>
        <translation>Minuten zwischen den Wellen</translation>
    </message>
    <message>
        <source>Most failed devices in percent</source>
        <translation>Höchstens fehlgeschlagene Geräte in Prozent</translation>
    </message>
    <message>
        <source> min</source>
        <translation> min</translation>
    </message>
    <message>
        <source> %</source>
        <translation> %</translation>
    </message>
    <message>
        <source>first</source>
        <translation>zuerst</translation>
    </message>
    <message>
        <source>wait</source>
        <translation>warten</translation>
    </message>
    <message>
        <source>go on if at most</source>
        <translation>weiter, wenn höchstens</translation>
    </message>
    <message>
        <source>failed</source>
        <translation>fehlschlagen</translation>
    </message>
</context>
<context>
    <name>RolloutMgr</name>
    <message>
        <source>The image has changed since the rollout began.</source>
        <translation>Das Image hat sich seit Beginn der Verteilung geändert.</translation>
    </message>
    <message>
        <source>The image could not be checked.</source>
        <translation>Das Image konnte nicht geprüft werden.</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>Das Hochladen konnte nicht gestartet werden.</translation>
    </message>
    <message numerus="yes">
        <source>The session has ended, and with it the rollout(s) of %1. Waves that were sent go on.</source>
        <translation>
            <numerusform>Die Sitzung ist beendet, und mit ihr die Verteilung von %1. Gesendete Wellen laufen weiter.</numerusform>
            <numerusform>Die Sitzung ist beendet, und mit ihr die Verteilungen von %1. Gesendete Wellen laufen weiter.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The server has ended the session. The rollout(s) of %1 go on after the next log-in.</source>
        <translation>
            <numerusform>Der Server hat die Sitzung beendet. Die Verteilung von %1 geht nach der nächsten Anmeldung weiter.</numerusform>
            <numerusform>Der Server hat die Sitzung beendet. Die Verteilungen von %1 gehen nach der nächsten Anmeldung weiter.</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>RolloutTexts</name>
    <message>
        <source>%1 of %2 done</source>
        <translation>%1 von %2 fertig</translation>
    </message>
    <message>
        <source>%1, %2 failed</source>
        <translation>%1, %2 fehlgeschlagen</translation>
    </message>
    <message>
        <source>Second wave</source>
        <translation>Zweite Welle</translation>
    </message>
    <message>
        <source>First wave</source>
        <translation>Erste Welle</translation>
    </message>
    <message numerus="yes">
        <source>%1: %n device(s), waiting to be sent.</source>
        <translation>
            <numerusform>%1: %n Gerät, wartet auf das Senden.</numerusform>
            <numerusform>%1: %n Geräte, warten auf das Senden.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1: %n device(s), scheduled for %2.</source>
        <translation>
            <numerusform>%1: %n Gerät, geplant für %2.</numerusform>
            <numerusform>%1: %n Geräte, geplant für %2.</numerusform>
        </translation>
    </message>
    <message>
        <source>%1: %2.</source>
        <translation>%1: %2.</translation>
    </message>
    <message>
        <source>Waiting %1 min.</source>
        <translation>Noch %1 min warten.</translation>
    </message>
    <message>
        <source>Stopped: more than %1 % of the first wave failed.</source>
        <translation>Angehalten: mehr als %1 % der ersten Welle sind fehlgeschlagen.</translation>
    </message>
    <message>
        <source>Stopped: the task of this wave was cancelled.</source>
        <translation>Angehalten: die Aufgabe dieser Welle wurde abgebrochen.</translation>
    </message>
    <message>
        <source>Stopped: this wave did not begin. %1</source>
        <translation>Angehalten: diese Welle wurde nicht begonnen. %1</translation>
    </message>
    <message>
        <source>Stopped.</source>
        <translation>Angehalten.</translation>
    </message>
    <message>
        <source>Finished: %1.</source>
        <translation>Abgeschlossen: %1.</translation>
    </message>
    <message numerus="yes">
        <source>Waiting for the second wave: %n device(s).</source>
        <translation>
            <numerusform>%n Gerät wartet auf die zweite Welle.</numerusform>
            <numerusform>%n Geräte warten auf die zweite Welle.</numerusform>
        </translation>
    </message>
    <message>
        <source>Stopped: the task of this wave is no longer in the list. The wave is not sent again.</source>
        <translation>Angehalten: Die Aufgabe dieser Welle steht nicht mehr in der Liste. Die Welle wird nicht noch einmal gesendet.</translation>
    </message>
</context>
<context>
    <name>ScheduleField</name>
    <message>
        <source>Now</source>
        <translation>Jetzt</translation>
    </message>
    <message>
        <source>At</source>
        <translation>Am</translation>
    </message>
    <message>
        <source>Time of the upload</source>
        <translation>Zeitpunkt des Hochladens</translation>
    </message>
    <message>
        <source>There is no such time on that day: the clocks are put forward.</source>
        <translation>Diese Uhrzeit gibt es an dem Tag nicht: die Uhren werden vorgestellt.</translation>
    </message>
    <message>
        <source>This time has passed; choose a later one.</source>
        <translation>Dieser Zeitpunkt ist vorbei; bitte einen späteren wählen.</translation>
    </message>
</context>
<context>
    <name>SelfSignedFields</name>
    <message>
        <source>Two letters, as in US</source>
        <translation>Zwei Buchstaben, etwa DE</translation>
    </message>
    <message>
        <source>Optional</source>
        <translation>Optional</translation>
    </message>
    <message>
        <source>Country</source>
        <translation>Land</translation>
    </message>
    <message>
        <source>State/Province</source>
        <translation>Bundesland/Kanton</translation>
    </message>
    <message>
        <source>Locality</source>
        <translation>Ort</translation>
    </message>
    <message>
        <source>Organization</source>
        <translation>Organisation</translation>
    </message>
    <message>
        <source>Organizational Unit</source>
        <translation>Organisationseinheit</translation>
    </message>
    <message>
        <source>Validity (days)</source>
        <translation>Gültigkeit (Tage)</translation>
    </message>
    <message>
        <source>The country is named by its two letters, as in US.</source>
        <translation>Das Land wird mit zwei Buchstaben angegeben, etwa DE.</translation>
    </message>
</context>
<context>
    <name>ServerDialog</name>
    <message>
        <source>Server Name</source>
        <translation>Servername</translation>
    </message>
    <message>
        <source>Server Information</source>
        <translation>Serveradresse</translation>
    </message>
    <message>
        <source>IP:Port/Domain Name</source>
        <translation>IP:Port/Domainname</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-Mail</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation>Zugangsdaten merken</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Hinzufügen</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Enter an address or a name, with a port from 1 to 65535 behind a colon if need be.</source>
        <translation>Eine Adresse oder einen Namen eingeben, bei Bedarf mit einem Port von 1 bis 65535 hinter einem Doppelpunkt.</translation>
    </message>
    <message>
        <source>The password is kept only with “Remember Me”.</source>
        <translation>Das Passwort wird nur mit „Zugangsdaten merken“ gespeichert.</translation>
    </message>
</context>
<context>
    <name>ServerKeyDialog</name>
    <message>
        <source>Remembered key (SHA-256)</source>
        <translation>Gemerkter Schlüssel (SHA-256)</translation>
    </message>
    <message>
        <source>Remembered key</source>
        <translation>Gemerkter Schlüssel</translation>
    </message>
    <message>
        <source>New key (SHA-256)</source>
        <translation>Neuer Schlüssel (SHA-256)</translation>
    </message>
    <message>
        <source>New key</source>
        <translation>Neuer Schlüssel</translation>
    </message>
    <message>
        <source>This is normal after the service was installed anew; otherwise somebody may be listening in between. Ask whoever looks after the server for its key, and trust the new one only if it matches.</source>
        <translation>Das ist normal, wenn der Dienst neu installiert wurde; sonst hört womöglich jemand dazwischen mit. Fragen Sie nach dem Schlüssel, wer den Server betreut, und vertrauen Sie dem neuen nur, wenn er übereinstimmt.</translation>
    </message>
    <message>
        <source>Trust the new key</source>
        <translation>Dem neuen Schlüssel vertrauen</translation>
    </message>
    <message>
        <source>Do not trust</source>
        <translation>Nicht vertrauen</translation>
    </message>
    <message>
        <source>The service on this computer shows another key than before, so nothing was sent to it.</source>
        <translation>Der Dienst auf diesem Computer zeigt einen anderen Schlüssel als bisher; deshalb wurde nichts an ihn gesendet.</translation>
    </message>
    <message>
        <source>Server Key Changed</source>
        <translation>Serverschlüssel geändert</translation>
    </message>
    <message>
        <source>The service on this computer shows another key than before. Nothing is sent to it.</source>
        <translation>Der Dienst auf diesem Computer zeigt einen anderen Schlüssel als bisher. Es wird nichts an ihn gesendet.</translation>
    </message>
    <message>
        <source>The server %1 shows another key than before. Nothing is sent to it.</source>
        <translation>Der Server %1 zeigt einen anderen Schlüssel als bisher. Es wird nichts an ihn gesendet.</translation>
    </message>
    <message>
        <source>First seen %1, last seen %2</source>
        <translation>Zuerst gesehen: %1, zuletzt gesehen: %2</translation>
    </message>
    <message>
        <source>First seen %1</source>
        <translation>Zuerst gesehen: %1</translation>
    </message>
</context>
<context>
    <name>ServerSettings</name>
    <message>
        <source>%1: the server&apos;s value %2 cannot be shown.</source>
        <translation>%1: Der Wert %2 des Servers kann nicht angezeigt werden.</translation>
    </message>
    <message>
        <source>%1: the server has %2, shown is %3.</source>
        <translation>%1: Der Server hat %2, angezeigt wird %3.</translation>
    </message>
    <message>
        <source>Notification banners for alarms</source>
        <translation>Hinweise zu Alarmen</translation>
    </message>
    <message>
        <source>Notification banners for tasks</source>
        <translation>Hinweise zu Aufgaben</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Number of days to keep logs</source>
        <translation>Anzahl der Tage, die Protokolle aufbewahrt werden</translation>
    </message>
    <message>
        <source>Default File Location</source>
        <translation>Standardspeicherort für Dateien</translation>
    </message>
    <message>
        <source>Automatic restore points</source>
        <translation>Automatische Wiederherstellungspunkte</translation>
    </message>
    <message>
        <source>Number of automatic restore points to keep</source>
        <translation>Anzahl aufzubewahrender automatischer Wiederherstellungspunkte</translation>
    </message>
    <message>
        <source>Limit of firmware uploads</source>
        <translation>Begrenzung der Firmware-Uploads</translation>
    </message>
    <message>
        <source>Number of simultaneous firmware uploads</source>
        <translation>Anzahl gleichzeitiger Firmware-Uploads</translation>
    </message>
    <message>
        <source>on</source>
        <translation>ein</translation>
    </message>
    <message>
        <source>off</source>
        <translation>aus</translation>
    </message>
    <message>
        <source>(empty)</source>
        <translation>(leer)</translation>
    </message>
</context>
<context>
    <name>ServiceManagement</name>
    <message>
        <source>connecting to ORB...</source>
        <translation>Verbindung mit ORB wird hergestellt ...</translation>
    </message>
    <message>
        <source>Only an administrator can connect the service.</source>
        <translation>Nur ein Administrator kann den Dienst verbinden.</translation>
    </message>
</context>
<context>
    <name>ServiceManagementAddServiceDialog</name>
    <message>
        <source>1</source>
        <translation>1</translation>
    </message>
    <message>
        <source>2</source>
        <translation>2</translation>
    </message>
    <message>
        <source>Choose a Norvell service to connect</source>
        <translation>Norvell-Dienst zum Verbinden wählen</translation>
    </message>
    <message>
        <source>Service</source>
        <translation>Dienst</translation>
    </message>
    <message>
        <source>Select a Norvell Service</source>
        <translation>Norvell-Dienst auswählen</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>E-Mail</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>Choose a location to synchronize devices</source>
        <translation>Ort zum Synchronisieren der Geräte wählen</translation>
    </message>
    <message>
        <source>Organization</source>
        <translation>Organisation</translation>
    </message>
    <message>
        <source>Select an Organization</source>
        <translation>Organisation auswählen</translation>
    </message>
    <message>
        <source>Site</source>
        <translation>Standort</translation>
    </message>
    <message>
        <source>Select a Site</source>
        <translation>Standort auswählen</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>Weiter</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell-Dienstverwaltung</translation>
    </message>
    <message>
        <source>Orb</source>
        <translation>Orb</translation>
    </message>
    <message>
        <source>Accounts, organizations and sites are managed in the %1.</source>
        <translation>Konten, Organisationen und Standorte werden im %1 verwaltet.</translation>
    </message>
    <message>
        <source>Norvell Partner Desk</source>
        <translation>Norvell Partner Desk</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>Das Feld darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Session expired. Click &apos;Back&apos; to go to the previous step and try again.</source>
        <translation>Die Sitzung ist abgelaufen. Mit „Zurück“ zum vorherigen Schritt gehen und erneut versuchen.</translation>
    </message>
    <message>
        <source>No organization or site exist. Create an organization first or site.</source>
        <translation>Keine Organisation und kein Standort vorhanden. Zuerst eine Organisation oder einen Standort erstellen.</translation>
    </message>
    <message>
        <source>One or more customers do not have remote access permission.</source>
        <translation>Einem oder mehreren Kunden fehlt die Berechtigung zum Fernzugriff.</translation>
    </message>
    <message>
        <source>Applying...</source>
        <translation>Wird übernommen ...</translation>
    </message>
    <message>
        <source>Applied successfully</source>
        <translation>Erfolgreich übernommen</translation>
    </message>
    <message>
        <source>Signing in...</source>
        <translation>Anmeldung läuft ...</translation>
    </message>
</context>
<context>
    <name>ServiceManagementStatusDialog</name>
    <message>
        <source>Service Connected</source>
        <translation>Dienst verbunden</translation>
    </message>
    <message>
        <source>The devices managed by this Device Manager are synced with the Norvell service. Disconnecting will stop synchronization, requiring re-setup to restore it.</source>
        <translation>Die Geräte, die dieser Device Manager verwaltet, werden mit dem Norvell-Dienst synchronisiert. Das Trennen beendet die Synchronisierung; um sie wieder aufzunehmen, ist eine neue Einrichtung nötig.</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>Trennen</translation>
    </message>
    <message>
        <source>Remote Access</source>
        <translation>Fernzugriff</translation>
    </message>
    <message>
        <source>Granting technical support personnel remote access to the devices for viewing device status, performing maintenance, and troubleshooting.</source>
        <translation>Gewährt dem technischen Support Fernzugriff auf die Geräte, um ihren Zustand einzusehen, sie zu warten und Fehler zu beheben.</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell-Dienstverwaltung</translation>
    </message>
    <message>
        <source>Reading the status...</source>
        <translation>Status wird gelesen ...</translation>
    </message>
    <message>
        <source>The status is not known.</source>
        <translation>Der Status ist nicht bekannt.</translation>
    </message>
    <message>
        <source>Connected</source>
        <translation>Verbunden</translation>
    </message>
    <message>
        <source>Not connected at the moment</source>
        <translation>Derzeit nicht verbunden</translation>
    </message>
    <message>
        <source>Only an administrator can change this.</source>
        <translation>Nur ein Administrator kann dies ändern.</translation>
    </message>
    <message>
        <source>Set Remote Access...</source>
        <translation>Fernzugriff wird eingestellt ...</translation>
    </message>
    <message>
        <source>Set remote access successfully!</source>
        <translation>Fernzugriff erfolgreich eingestellt!</translation>
    </message>
    <message>
        <source>Failed to set remote access.</source>
        <translation>Der Fernzugriff konnte nicht eingestellt werden.</translation>
    </message>
    <message>
        <source>Disconnecting...</source>
        <translation>Verbindung wird getrennt ...</translation>
    </message>
    <message>
        <source>Disconnected successfully!</source>
        <translation>Verbindung erfolgreich getrennt!</translation>
    </message>
</context>
<context>
    <name>SetPasswordDialog</name>
    <message>
        <source>Strength: weak</source>
        <translation>Stärke: schwach</translation>
    </message>
    <message>
        <source>Strength: fair</source>
        <translation>Stärke: mittel</translation>
    </message>
    <message>
        <source>Strength: strong</source>
        <translation>Stärke: stark</translation>
    </message>
    <message>
        <source>Strength: --</source>
        <translation>Stärke: --</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>Passwort festlegen</translation>
    </message>
    <message>
        <source>Username</source>
        <translation>Benutzername</translation>
    </message>
    <message>
        <source>New Password</source>
        <translation>Neues Passwort</translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation>Passwort bestätigen</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>Generate a password</source>
        <translation>Passwort erzeugen</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>Password Policy</source>
        <translation>Passwortrichtlinie</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will refuse this password by their policy.</source>
        <translation>
            <numerusform>%n Gerät wird dieses Passwort nach seiner Richtlinie ablehnen.</numerusform>
            <numerusform>%n Geräte werden dieses Passwort nach ihrer Richtlinie ablehnen.</numerusform>
        </translation>
    </message>
    <message>
        <source>Against its policy</source>
        <translation>Verstößt gegen die Richtlinie</translation>
    </message>
    <message>
        <source>New Password and Confirm Password don&apos;t match.</source>
        <translation>Neues Passwort und Bestätigung stimmen nicht überein.</translation>
    </message>
    <message>
        <source>Username and password are too long: together they may have %1 characters.</source>
        <translation>Benutzername und Passwort sind zu lang: Zusammen dürfen sie %1 Zeichen haben.</translation>
    </message>
</context>
<context>
    <name>SettingWindow</name>
    <message>
        <source>Retry</source>
        <translation>Erneut versuchen</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>Übernehmen</translation>
    </message>
    <message>
        <source>Changes were taken back.</source>
        <translation>Die Änderungen wurden zurückgenommen.</translation>
    </message>
    <message>
        <source>Loading settings...</source>
        <translation>Einstellungen werden geladen ...</translation>
    </message>
    <message>
        <source>The settings could not be read: %1.</source>
        <translation>Die Einstellungen konnten nicht gelesen werden: %1.</translation>
    </message>
    <message>
        <source>The server offers no settings.</source>
        <translation>Der Server bietet keine Einstellungen an.</translation>
    </message>
    <message>
        <source>Saving settings...</source>
        <translation>Einstellungen werden gespeichert ...</translation>
    </message>
    <message>
        <source>The settings could not be saved: %1.</source>
        <translation>Die Einstellungen konnten nicht gespeichert werden: %1.</translation>
    </message>
    <message>
        <source>Settings saved.</source>
        <translation>Einstellungen gespeichert.</translation>
    </message>
    <message>
        <source>The server&apos;s settings were kept.</source>
        <translation>Die Einstellungen des Servers wurden beibehalten.</translation>
    </message>
</context>
<context>
    <name>SettingsChangedDialog</name>
    <message>
        <source>Settings Changed Meanwhile</source>
        <translation>Einstellungen inzwischen geändert</translation>
    </message>
    <message>
        <source>Somebody else has changed these settings since you opened the page. Nothing is saved yet.</source>
        <translation>Jemand anderes hat diese Einstellungen geändert, seit die Seite geöffnet wurde. Noch ist nichts gespeichert.</translation>
    </message>
    <message>
        <source>Setting</source>
        <translation>Einstellung</translation>
    </message>
    <message>
        <source>This page</source>
        <translation>Diese Seite</translation>
    </message>
    <message>
        <source>Server now</source>
        <translation>Server jetzt</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>Save this page&apos;s values</source>
        <translation>Werte dieser Seite speichern</translation>
    </message>
    <message>
        <source>Keep the server&apos;s values</source>
        <translation>Werte des Servers behalten</translation>
    </message>
</context>
<context>
    <name>SettingsForm</name>
    <message>
        <source>Client</source>
        <translation>Client</translation>
    </message>
    <message>
        <source>Notification</source>
        <translation>Benachrichtigung</translation>
    </message>
    <message>
        <source>Pop up  notification banners for all the alarms</source>
        <translation>Hinweise zu allen Alarmen einblenden</translation>
    </message>
    <message>
        <source>Pop up  notification banners for all the tasks</source>
        <translation>Hinweise zu allen Aufgaben einblenden</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>Sprache</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Server</translation>
    </message>
    <message>
        <source>Log</source>
        <translation>Protokoll</translation>
    </message>
    <message>
        <source>Number of days to keep logs</source>
        <translation>Anzahl der Tage, die Protokolle aufbewahrt werden</translation>
    </message>
    <message>
        <source>Device Management</source>
        <translation>Geräteverwaltung</translation>
    </message>
    <message>
        <source>Default File Location</source>
        <translation>Standardspeicherort für Dateien</translation>
    </message>
    <message>
        <source>Configuration Restore Point</source>
        <translation>Wiederherstellungspunkt der Konfiguration</translation>
    </message>
    <message>
        <source>Create configuration restore points automatically every night if configuration changes are detected.</source>
        <translation>Jede Nacht automatisch Wiederherstellungspunkte der Konfiguration erstellen, wenn sie sich geändert hat.</translation>
    </message>
    <message>
        <source>Number of automatic restore points to keep</source>
        <translation>Anzahl aufzubewahrender automatischer Wiederherstellungspunkte</translation>
    </message>
    <message>
        <source>for each camera</source>
        <translation>je Kamera</translation>
    </message>
    <message>
        <source>Firmware Upload Limit</source>
        <translation>Begrenzung der Firmware-Uploads</translation>
    </message>
    <message>
        <source>Upload firmware to up to</source>
        <translation>Firmware gleichzeitig auf höchstens</translation>
    </message>
    <message>
        <source>Upload firmware to up to so many devices simultaneously.</source>
        <translation>Firmware gleichzeitig auf höchstens so viele Geräte hochladen.</translation>
    </message>
    <message>
        <source>devices simultaneously.</source>
        <translation>Geräte hochladen.</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>Durchsuchen</translation>
    </message>
    <message>
        <source>Select Directory</source>
        <translation>Ordner auswählen</translation>
    </message>
    <message>
        <source>Language of the user interface</source>
        <translation>Sprache der Benutzeroberfläche</translation>
    </message>
    <message>
        <source>As the system</source>
        <translation>Wie das System</translation>
    </message>
    <message>
        <source>Another language is used from the next start of the program on.</source>
        <translation>Eine andere Sprache gilt ab dem nächsten Start des Programms.</translation>
    </message>
</context>
<context>
    <name>SidePanel</name>
    <message>
        <source>Alarms</source>
        <translation>Alarme</translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation>Aufgaben</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>SiteCommit</name>
    <message>
        <source>The site changes could not be sent. Press Apply to try again.</source>
        <translation>Die Standortänderungen konnten nicht gesendet werden. Mit „Übernehmen“ erneut versuchen.</translation>
    </message>
    <message>
        <source>The site changes could not be sent: %1. Press Apply to try again.</source>
        <translation>Die Standortänderungen konnten nicht gesendet werden: %1. Mit „Übernehmen“ erneut versuchen.</translation>
    </message>
</context>
<context>
    <name>SiteEdits</name>
    <message>
        <source>Site</source>
        <translation>Standort</translation>
    </message>
    <message>
        <source>The site does not exist any more.</source>
        <translation>Der Standort ist nicht mehr vorhanden.</translation>
    </message>
    <message>
        <source>A site needs a name.</source>
        <translation>Ein Standort braucht einen Namen.</translation>
    </message>
    <message>
        <source>The name of a site has at most %1 characters.</source>
        <translation>Der Name eines Standorts hat höchstens %1 Zeichen.</translation>
    </message>
    <message>
        <source>A site cannot be moved into itself.</source>
        <translation>Ein Standort kann nicht in sich selbst verschoben werden.</translation>
    </message>
    <message>
        <source>The site is there already.</source>
        <translation>Der Standort ist bereits dort.</translation>
    </message>
    <message>
        <source>The target does not exist any more.</source>
        <translation>Das Ziel ist nicht mehr vorhanden.</translation>
    </message>
    <message>
        <source>A site cannot be moved into one of its sub-sites.</source>
        <translation>Ein Standort kann nicht in einen seiner Unterstandorte verschoben werden.</translation>
    </message>
    <message>
        <source>Sites nest at most %1 levels deep.</source>
        <translation>Standorte lassen sich höchstens %1 Ebenen tief schachteln.</translation>
    </message>
    <message>
        <source>The site &quot;%1&quot; was deleted by somebody else, and your changes to it with it.</source>
        <translation>Der Standort „%1“ wurde von jemand anderem gelöscht, und die eigenen Änderungen daran mit ihm.</translation>
    </message>
    <message>
        <source>The site &quot;%1&quot; stays where it was, since somebody else has changed the sites there.</source>
        <translation>Der Standort „%1“ bleibt, wo er war, weil jemand anderes die Standorte dort geändert hat.</translation>
    </message>
    <message>
        <source>The new site &quot;%1&quot; is gone, since somebody else has changed the sites above it.</source>
        <translation>Der neue Standort „%1“ entfällt, weil jemand anderes die Standorte darüber geändert hat.</translation>
    </message>
</context>
<context>
    <name>SiteTree</name>
    <message>
        <source>Site name</source>
        <translation>Name des Standorts</translation>
    </message>
    <message>
        <source>(no name)</source>
        <translation>(kein Name)</translation>
    </message>
    <message>
        <source>Copy %1 device</source>
        <translation>%1 Gerät kopieren</translation>
    </message>
    <message>
        <source>Copy %1 devices</source>
        <translation>%1 Geräte kopieren</translation>
    </message>
    <message>
        <source>Move %1 device</source>
        <translation>%1 Gerät verschieben</translation>
    </message>
    <message>
        <source>Move %1 devices</source>
        <translation>%1 Geräte verschieben</translation>
    </message>
    <message>
        <source>Sites</source>
        <translation>Standorte</translation>
    </message>
    <message>
        <source>Add a site</source>
        <translation>Einen Standort hinzufügen</translation>
    </message>
    <message>
        <source>DEVICE</source>
        <translation>GERÄTE</translation>
    </message>
    <message>
        <source>SITE MANAGEMENT</source>
        <translation>STANDORTVERWALTUNG</translation>
    </message>
    <message>
        <source>Device Overview</source>
        <translation>Geräteübersicht</translation>
    </message>
    <message>
        <source>Add Site</source>
        <translation>Standort hinzufügen</translation>
    </message>
    <message>
        <source>Edit Site</source>
        <translation>Standort bearbeiten</translation>
    </message>
    <message>
        <source>Delete Site</source>
        <translation>Standort löschen</translation>
    </message>
    <message>
        <source>A site can only be dropped on a site or between sites.</source>
        <translation>Ein Standort kann nur auf einem Standort oder zwischen Standorten abgelegt werden.</translation>
    </message>
    <message>
        <source>Devices can only be dropped on a site.</source>
        <translation>Geräte können nur auf einem Standort abgelegt werden.</translation>
    </message>
    <message>
        <source>Apply the site changes first.</source>
        <translation>Übernehmen Sie zuerst die Standortänderungen.</translation>
    </message>
</context>
<context>
    <name>StartCheck</name>
    <message>
        <source>Norvell Device Manager Service Control is not installed on this computer. Please connect to a remote server.</source>
        <translation>Norvell Device Manager Service Control ist auf diesem Computer nicht installiert. Bitte mit einem Remoteserver verbinden.</translation>
    </message>
    <message>
        <source>Norvell Device Manager Service Control is not running on this computer. Please check the status of local server or connect to a remote server.</source>
        <translation>Norvell Device Manager Service Control läuft auf diesem Computer nicht. Bitte den Zustand des lokalen Servers prüfen oder mit einem Remoteserver verbinden.</translation>
    </message>
</context>
<context>
    <name>StateRefresh</name>
    <message>
        <source>The device states could not be read. Try again.</source>
        <translation>Die Gerätezustände konnten nicht gelesen werden. Bitte erneut versuchen.</translation>
    </message>
    <message>
        <source>The device states could not be read: the client is busy, try again.</source>
        <translation>Die Gerätezustände konnten nicht gelesen werden: Das Programm ist beschäftigt, versuchen Sie es erneut.</translation>
    </message>
</context>
<context>
    <name>TargetListDialog</name>
    <message>
        <source>Devices</source>
        <translation>Geräte</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>Modell, IP oder MAC suchen</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation>Alle auswählen/abwählen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
</context>
<context>
    <name>TargetModel</name>
    <message>
        <source>%1, %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>Hinweis</translation>
    </message>
</context>
<context>
    <name>TargetSummary</name>
    <message>
        <source>Show</source>
        <translation>Anzeigen</translation>
    </message>
    <message>
        <source>%1 of %2 devices selected</source>
        <translation>%1 von %2 Geräten ausgewählt</translation>
    </message>
    <message numerus="yes">
        <source>%Ln device(s) selected</source>
        <translation>
            <numerusform>%Ln Gerät ausgewählt</numerusform>
            <numerusform>%Ln Geräte ausgewählt</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>TargetWarningLines</name>
    <message>
        <source>Leave them out</source>
        <translation>Auslassen</translation>
    </message>
</context>
<context>
    <name>TaskAnnouncer</name>
    <message>
        <source>Task - Upload Firmware created</source>
        <translation>Aufgabe „Firmware hochladen“ angelegt</translation>
    </message>
    <message>
        <source>Task - Upload Firmware processing</source>
        <translation>Aufgabe „Firmware hochladen“ in Arbeit</translation>
    </message>
    <message>
        <source>Task - Upload Firmware finished</source>
        <translation>Aufgabe „Firmware hochladen“ abgeschlossen</translation>
    </message>
    <message>
        <source>Task - Upload Configuration File processing</source>
        <translation>Aufgabe „Konfigurationsdatei hochladen“ in Arbeit</translation>
    </message>
    <message>
        <source>Task - Upload Configuration File finished</source>
        <translation>Aufgabe „Konfigurationsdatei hochladen“ abgeschlossen</translation>
    </message>
    <message>
        <source>Task - Upload Package File processing</source>
        <translation>Aufgabe „Paketdatei hochladen“ in Arbeit</translation>
    </message>
    <message>
        <source>Task - Upload Package File finished</source>
        <translation>Aufgabe „Paketdatei hochladen“ abgeschlossen</translation>
    </message>
</context>
<context>
    <name>TaskPanel</name>
    <message>
        <source>Copy</source>
        <translation>Kopieren</translation>
    </message>
    <message>
        <source>Retry failed</source>
        <translation>Fehler wiederholen</translation>
    </message>
    <message>
        <source>Cancel task</source>
        <translation>Aufgabe abbrechen</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Entfernen</translation>
    </message>
    <message>
        <source>All</source>
        <translation>Alle</translation>
    </message>
    <message>
        <source>Active</source>
        <translation>Aktiv</translation>
    </message>
    <message>
        <source>Failed</source>
        <translation>Fehlgeschlagen</translation>
    </message>
    <message>
        <source>Remove finished</source>
        <translation>Fertige entfernen</translation>
    </message>
    <message>
        <source>Remove all finished tasks from the list</source>
        <translation>Alle abgeschlossenen Aufgaben aus der Liste entfernen</translation>
    </message>
    <message>
        <source>Search task, user, model, IP, MAC, state</source>
        <translation>Aufgabe, Benutzer, Modell, IP, MAC, Zustand suchen</translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation>Aufgaben</translation>
    </message>
    <message>
        <source>Loading tasks...</source>
        <translation>Aufgaben werden geladen ...</translation>
    </message>
    <message>
        <source>The task list could not be read.</source>
        <translation>Die Aufgabenliste konnte nicht gelesen werden.</translation>
    </message>
    <message>
        <source>No tasks.
What is done to devices shows here.</source>
        <translation>Keine Aufgaben.
Was mit Geräten getan wird, erscheint hier.</translation>
    </message>
    <message>
        <source>No task matches the filter.</source>
        <translation>Keine Aufgabe passt zum Filter.</translation>
    </message>
    <message>
        <source>The tasks could not be read since %1.</source>
        <translation>Die Aufgaben konnten seit %1 nicht gelesen werden.</translation>
    </message>
    <message>
        <source>This client cannot retry the task: it was started elsewhere or before the last log-in, so its settings are not known here.</source>
        <translation>Dieser Client kann die Aufgabe nicht wiederholen: Sie wurde woanders oder vor der letzten Anmeldung gestartet, daher sind ihre Einstellungen hier nicht bekannt.</translation>
    </message>
    <message>
        <source>Retrying asks for the password or key again.</source>
        <translation>Beim Wiederholen wird erneut nach dem Passwort oder Schlüssel gefragt.</translation>
    </message>
    <message>
        <source>Its rollout or its repetition sees to the devices that failed.</source>
        <translation>Um die Geräte, bei denen es fehlschlug, kümmert sich der Rollout oder die Wiederholung.</translation>
    </message>
</context>
<context>
    <name>TaskQueue</name>
    <message>
        <source>Reason: %1.</source>
        <translation>Grund: %1.</translation>
    </message>
    <message>
        <source>The server has ended the session.</source>
        <translation>Der Server hat die Sitzung beendet.</translation>
    </message>
</context>
<context>
    <name>TaskState</name>
    <message>
        <source>Requesting</source>
        <translation>Wird angefordert</translation>
    </message>
    <message>
        <source>Queuing</source>
        <translation>In der Warteschlange</translation>
    </message>
    <message>
        <source>Processing</source>
        <translation>In Arbeit</translation>
    </message>
    <message>
        <source>(1/3) File is uploading...</source>
        <translation>(1/3) Datei wird hochgeladen ...</translation>
    </message>
    <message>
        <source>(2/3) Device is updating...</source>
        <translation>(2/3) Gerät wird aktualisiert ...</translation>
    </message>
    <message>
        <source>(3/3) Device is reconnecting...</source>
        <translation>(3/3) Gerät verbindet sich neu ...</translation>
    </message>
    <message>
        <source>Scheduled</source>
        <translation>Geplant</translation>
    </message>
    <message>
        <source>Applied successfully</source>
        <translation>Erfolgreich übernommen</translation>
    </message>
    <message>
        <source>Uploaded successfully</source>
        <translation>Erfolgreich hochgeladen</translation>
    </message>
    <message>
        <source>Failed</source>
        <translation>Fehlgeschlagen</translation>
    </message>
    <message>
        <source>Mismatching status</source>
        <translation>Unpassender Zustand</translation>
    </message>
    <message>
        <source>Unsupported method</source>
        <translation>Nicht unterstützte Methode</translation>
    </message>
    <message>
        <source>Mismatching private key and certificate</source>
        <translation>Privater Schlüssel und Zertifikat passen nicht zusammen</translation>
    </message>
    <message>
        <source>Invalid file or public key</source>
        <translation>Ungültige Datei oder ungültiger öffentlicher Schlüssel</translation>
    </message>
    <message>
        <source>Certificate not installed</source>
        <translation>Zertifikat nicht installiert</translation>
    </message>
    <message>
        <source>Not installed</source>
        <translation>Nicht installiert</translation>
    </message>
    <message>
        <source>Device response timeout</source>
        <translation>Zeitüberschreitung der Geräteantwort</translation>
    </message>
    <message>
        <source>Device response timeout. Contact Norvell technical support for further assistant.</source>
        <translation>Zeitüberschreitung der Geräteantwort. Bitte den technischen Support von Norvell um Hilfe bitten.</translation>
    </message>
    <message>
        <source>Failed to connect to device</source>
        <translation>Keine Verbindung zum Gerät</translation>
    </message>
    <message>
        <source>Failed to connect to device. Check device status and connection, then retry.</source>
        <translation>Keine Verbindung zum Gerät. Zustand und Verbindung des Geräts prüfen und erneut versuchen.</translation>
    </message>
    <message>
        <source>Failed to set password to device</source>
        <translation>Das Passwort konnte auf dem Gerät nicht festgelegt werden</translation>
    </message>
    <message>
        <source>Invalid file for this model group</source>
        <translation>Ungültige Datei für diese Modellgruppe</translation>
    </message>
    <message>
        <source>Failed to upload: Incompatible Firmware. Check the firmware release notes for compatibility.</source>
        <translation>Hochladen fehlgeschlagen: Unpassende Firmware. In den Versionshinweisen der Firmware die Kompatibilität prüfen.</translation>
    </message>
    <message>
        <source>Failed to upload: No SD card detected. Check SD card status, then retry.</source>
        <translation>Hochladen fehlgeschlagen: Keine SD-Karte erkannt. Zustand der SD-Karte prüfen und erneut versuchen.</translation>
    </message>
    <message>
        <source> SD card error. Check SD card status, then retry.</source>
        <translation> SD-Kartenfehler. Zustand der SD-Karte prüfen und erneut versuchen.</translation>
    </message>
    <message>
        <source> Reached maximum package upload limit. Check package status, then retry.</source>
        <translation> Höchstzahl hochgeladener Pakete erreicht. Zustand der Pakete prüfen und erneut versuchen.</translation>
    </message>
    <message>
        <source> Insufficient storage. Check storage status, then retry.</source>
        <translation> Zu wenig Speicherplatz. Zustand des Speichers prüfen und erneut versuchen.</translation>
    </message>
    <message>
        <source> Broken or invalid file. Select valid file, then retry.</source>
        <translation> Beschädigte oder ungültige Datei. Gültige Datei auswählen und erneut versuchen.</translation>
    </message>
    <message>
        <source> Internal process error.Contact Norvell technical support for further assistant.</source>
        <translation> Interner Verarbeitungsfehler. Bitte den technischen Support von Norvell um Hilfe bitten.</translation>
    </message>
    <message>
        <source>Failed to upload: </source>
        <translation>Hochladen fehlgeschlagen: </translation>
    </message>
</context>
<context>
    <name>TaskTexts</name>
    <message numerus="yes">
        <source>%n device(s): %1</source>
        <translation>
            <numerusform>%n Gerät: %1</numerusform>
            <numerusform>%n Geräte: %1</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 of %2 failed: %3</source>
        <translation>%1 von %2 fehlgeschlagen: %3</translation>
    </message>
    <message>
        <source>Started at %1</source>
        <translation>Gestartet: %1</translation>
    </message>
    <message>
        <source>Started by %1 at %2</source>
        <translation>Gestartet von %1: %2</translation>
    </message>
    <message>
        <source>Scheduled for %1</source>
        <translation>Geplant für %1</translation>
    </message>
    <message>
        <source>an unknown time</source>
        <translation>unbekannter Zeitpunkt</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) · %1</source>
        <translation>
            <numerusform>%n Gerät · %1</numerusform>
            <numerusform>%n Geräte · %1</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>TaskType</name>
    <message>
        <source>Upload Firmware</source>
        <translation>Firmware hochladen</translation>
    </message>
    <message>
        <source>Upload Configuration File</source>
        <translation>Konfigurationsdatei hochladen</translation>
    </message>
    <message>
        <source>Upload Package</source>
        <translation>Paket hochladen</translation>
    </message>
    <message>
        <source>Generate HTTPS Certificate</source>
        <translation>HTTPS-Zertifikat erzeugen</translation>
    </message>
    <message>
        <source>Install HTTPS Certificate</source>
        <translation>HTTPS-Zertifikat installieren</translation>
    </message>
    <message>
        <source>Upload HTTPS Certificate and Key</source>
        <translation>HTTPS-Zertifikat und Schlüssel hochladen</translation>
    </message>
    <message>
        <source>Upload IEEE 802.1x Certificate (EAP-PEAP)</source>
        <translation>IEEE-802.1x-Zertifikat hochladen (EAP-PEAP)</translation>
    </message>
    <message>
        <source>Upload IEEE 802.1x Certificate (EAP-TLS)</source>
        <translation>IEEE-802.1x-Zertifikat hochladen (EAP-TLS)</translation>
    </message>
    <message>
        <source>Assign IP Address (Auto)</source>
        <translation>IP-Adresse zuweisen (automatisch)</translation>
    </message>
    <message>
        <source>Assign IP Address (Manual)</source>
        <translation>IP-Adresse zuweisen (manuell)</translation>
    </message>
    <message>
        <source>Export Debug Info</source>
        <translation>Debug-Infos exportieren</translation>
    </message>
    <message>
        <source>Quick Setup</source>
        <translation>Schnelleinrichtung</translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation>Gerät neu starten</translation>
    </message>
    <message>
        <source>Restore Device</source>
        <translation>Gerät zurücksetzen</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>Passwort festlegen</translation>
    </message>
    <message>
        <source>Set Password Policy</source>
        <translation>Passwortrichtlinie festlegen</translation>
    </message>
    <message>
        <source>Create Template</source>
        <translation>Vorlage erstellen</translation>
    </message>
    <message>
        <source>Set Configuration</source>
        <translation>Konfiguration setzen</translation>
    </message>
    <message>
        <source>Custom Command</source>
        <translation>Eigener Befehl</translation>
    </message>
    <message>
        <source>Task</source>
        <translation>Aufgabe</translation>
    </message>
</context>
<context>
    <name>TimeSyncFields</name>
    <message numerus="yes">
        <source>Every %n hour(s)</source>
        <translation>
            <numerusform>Alle %n Std.</numerusform>
            <numerusform>Alle %n Std.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Every %n minute(s)</source>
        <translation>
            <numerusform>Alle %n Min.</numerusform>
            <numerusform>Alle %n Min.</numerusform>
        </translation>
    </message>
    <message>
        <source>Time synchronization</source>
        <translation>Zeitsynchronisierung</translation>
    </message>
    <message>
        <source>Set once from this computer</source>
        <translation>Einmal nach diesem Computer stellen</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>NTP-Server</translation>
    </message>
    <message>
        <source>NTP server %1</source>
        <translation>NTP-Server %1</translation>
    </message>
    <message>
        <source>Update interval</source>
        <translation>Aktualisierungsintervall</translation>
    </message>
    <message>
        <source>“%1” is no name or address of a server.</source>
        <translation>„%1“ ist kein Name und keine Adresse eines Servers.</translation>
    </message>
    <message>
        <source>The server “%1” is named twice.</source>
        <translation>Der Server „%1“ ist doppelt angegeben.</translation>
    </message>
    <message>
        <source>Name at least one NTP server.</source>
        <translation>Mindestens einen NTP-Server angeben.</translation>
    </message>
</context>
<context>
    <name>TimeZones</name>
    <message>
        <source>Pago Pago</source>
        <translation>Pago Pago</translation>
    </message>
    <message>
        <source>Honolulu</source>
        <translation>Honolulu</translation>
    </message>
    <message>
        <source>Anchorage</source>
        <translation>Anchorage</translation>
    </message>
    <message>
        <source>Los Angeles, Vancouver</source>
        <translation>Los Angeles, Vancouver</translation>
    </message>
    <message>
        <source>Denver, Edmonton</source>
        <translation>Denver, Edmonton</translation>
    </message>
    <message>
        <source>Phoenix</source>
        <translation>Phoenix</translation>
    </message>
    <message>
        <source>Chicago, Winnipeg</source>
        <translation>Chicago, Winnipeg</translation>
    </message>
    <message>
        <source>Mexico City, Guatemala</source>
        <translation>Mexiko-Stadt, Guatemala</translation>
    </message>
    <message>
        <source>New York, Toronto</source>
        <translation>New York, Toronto</translation>
    </message>
    <message>
        <source>Bogotá, Lima</source>
        <translation>Bogotá, Lima</translation>
    </message>
    <message>
        <source>Halifax</source>
        <translation>Halifax</translation>
    </message>
    <message>
        <source>Caracas, La Paz</source>
        <translation>Caracas, La Paz</translation>
    </message>
    <message>
        <source>Santiago</source>
        <translation>Santiago</translation>
    </message>
    <message>
        <source>St. John’s</source>
        <translation>St. John’s</translation>
    </message>
    <message>
        <source>São Paulo, Buenos Aires</source>
        <translation>São Paulo, Buenos Aires</translation>
    </message>
    <message>
        <source>South Georgia</source>
        <translation>Südgeorgien</translation>
    </message>
    <message>
        <source>Azores</source>
        <translation>Azoren</translation>
    </message>
    <message>
        <source>Praia</source>
        <translation>Praia</translation>
    </message>
    <message>
        <source>Coordinated Universal Time</source>
        <translation>Koordinierte Weltzeit</translation>
    </message>
    <message>
        <source>London, Dublin</source>
        <translation>London, Dublin</translation>
    </message>
    <message>
        <source>Lisbon</source>
        <translation>Lissabon</translation>
    </message>
    <message>
        <source>Accra, Reykjavik</source>
        <translation>Accra, Reykjavik</translation>
    </message>
    <message>
        <source>Berlin, Madrid, Paris, Rome</source>
        <translation>Berlin, Madrid, Paris, Rom</translation>
    </message>
    <message>
        <source>Algiers, Tunis</source>
        <translation>Algier, Tunis</translation>
    </message>
    <message>
        <source>Lagos</source>
        <translation>Lagos</translation>
    </message>
    <message>
        <source>Athens, Helsinki, Kyiv</source>
        <translation>Athen, Helsinki, Kiew</translation>
    </message>
    <message>
        <source>Cairo</source>
        <translation>Kairo</translation>
    </message>
    <message>
        <source>Jerusalem</source>
        <translation>Jerusalem</translation>
    </message>
    <message>
        <source>Johannesburg</source>
        <translation>Johannesburg</translation>
    </message>
    <message>
        <source>Istanbul, Riyadh</source>
        <translation>Istanbul, Riad</translation>
    </message>
    <message>
        <source>Moscow</source>
        <translation>Moskau</translation>
    </message>
    <message>
        <source>Nairobi</source>
        <translation>Nairobi</translation>
    </message>
    <message>
        <source>Tehran</source>
        <translation>Teheran</translation>
    </message>
    <message>
        <source>Baku, Dubai</source>
        <translation>Baku, Dubai</translation>
    </message>
    <message>
        <source>Kabul</source>
        <translation>Kabul</translation>
    </message>
    <message>
        <source>Karachi</source>
        <translation>Karatschi</translation>
    </message>
    <message>
        <source>Tashkent</source>
        <translation>Taschkent</translation>
    </message>
    <message>
        <source>Delhi, Mumbai</source>
        <translation>Delhi, Mumbai</translation>
    </message>
    <message>
        <source>Kathmandu</source>
        <translation>Kathmandu</translation>
    </message>
    <message>
        <source>Dhaka</source>
        <translation>Dhaka</translation>
    </message>
    <message>
        <source>Yangon</source>
        <translation>Rangun</translation>
    </message>
    <message>
        <source>Bangkok, Hanoi</source>
        <translation>Bangkok, Hanoi</translation>
    </message>
    <message>
        <source>Jakarta</source>
        <translation>Jakarta</translation>
    </message>
    <message>
        <source>Beijing, Shanghai, Taipei</source>
        <translation>Peking, Shanghai, Taipeh</translation>
    </message>
    <message>
        <source>Hong Kong</source>
        <translation>Hongkong</translation>
    </message>
    <message>
        <source>Manila</source>
        <translation>Manila</translation>
    </message>
    <message>
        <source>Kuala Lumpur, Singapore</source>
        <translation>Kuala Lumpur, Singapur</translation>
    </message>
    <message>
        <source>Perth</source>
        <translation>Perth</translation>
    </message>
    <message>
        <source>Tokyo</source>
        <translation>Tokio</translation>
    </message>
    <message>
        <source>Seoul</source>
        <translation>Seoul</translation>
    </message>
    <message>
        <source>Darwin</source>
        <translation>Darwin</translation>
    </message>
    <message>
        <source>Adelaide</source>
        <translation>Adelaide</translation>
    </message>
    <message>
        <source>Brisbane</source>
        <translation>Brisbane</translation>
    </message>
    <message>
        <source>Melbourne, Sydney</source>
        <translation>Melbourne, Sydney</translation>
    </message>
    <message>
        <source>Nouméa</source>
        <translation>Nouméa</translation>
    </message>
    <message>
        <source>Suva</source>
        <translation>Suva</translation>
    </message>
    <message>
        <source>Auckland</source>
        <translation>Auckland</translation>
    </message>
    <message>
        <source>Nukuʻalofa</source>
        <translation>Nukuʻalofa</translation>
    </message>
</context>
<context>
    <name>TitleBar</name>
    <message>
        <source>Help</source>
        <translation>Hilfe</translation>
    </message>
    <message>
        <source>Account</source>
        <translation>Konto</translation>
    </message>
    <message>
        <source>Minimize</source>
        <translation>Minimieren</translation>
    </message>
    <message>
        <source>Maximize</source>
        <translation>Maximieren</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>Wiederherstellen</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>Schließen</translation>
    </message>
    <message>
        <source>Account Management</source>
        <translation>Kontoverwaltung</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell-Dienstverwaltung</translation>
    </message>
    <message>
        <source>About</source>
        <translation>Info</translation>
    </message>
    <message>
        <source>Log off</source>
        <translation>Abmelden</translation>
    </message>
    <message>
        <source>The service is connected.</source>
        <translation>Der Dienst ist verbunden.</translation>
    </message>
</context>
<context>
    <name>Transfer</name>
    <message>
        <source>It was cancelled.</source>
        <translation>Es wurde abgebrochen.</translation>
    </message>
    <message>
        <source>The file “%1” cannot be read.</source>
        <translation>Die Datei „%1“ kann nicht gelesen werden.</translation>
    </message>
    <message>
        <source>The file “%1” is empty.</source>
        <translation>Die Datei „%1“ ist leer.</translation>
    </message>
    <message>
        <source>The file “%1” was changed while it was being sent.</source>
        <translation>Die Datei „%1“ wurde während der Übertragung geändert.</translation>
    </message>
    <message>
        <source>The file “%1” disappeared while it was being sent.</source>
        <translation>Die Datei „%1“ ist während der Übertragung verschwunden.</translation>
    </message>
    <message>
        <source>The service refused it or the connection was lost.</source>
        <translation>Der Dienst hat es abgelehnt, oder die Verbindung ist abgebrochen.</translation>
    </message>
    <message>
        <source>Nothing got through to the service for too long.</source>
        <translation>Zu lange kam nichts beim Dienst an.</translation>
    </message>
    <message>
        <source>The service does not take files of this size.</source>
        <translation>Der Dienst nimmt keine Dateien dieser Größe an.</translation>
    </message>
    <message>
        <source>The file “%1” exists already or cannot be written.</source>
        <translation>Die Datei „%1“ ist schon vorhanden oder kann nicht geschrieben werden.</translation>
    </message>
</context>
<context>
    <name>TransferBanner</name>
    <message>
        <source>Upload progress</source>
        <translation>Fortschritt des Hochladens</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>Abbrechen</translation>
    </message>
    <message>
        <source>%1 of %2, %3 per second</source>
        <translation>%1 von %2, %3 pro Sekunde</translation>
    </message>
    <message>
        <source>%1 sent, waiting for the server.</source>
        <translation>%1 gesendet, auf den Server wird gewartet.</translation>
    </message>
    <message>
        <source>Cancelling...</source>
        <translation>Wird abgebrochen ...</translation>
    </message>
</context>
<context>
    <name>UploadConfigurationDialog</name>
    <message>
        <source>Upload Configuration File</source>
        <translation>Konfigurationsdatei hochladen</translation>
    </message>
    <message>
        <source>Configuration file</source>
        <translation>Konfigurationsdatei</translation>
    </message>
    <message>
        <source>Choose Configuration File</source>
        <translation>Konfigurationsdatei wählen</translation>
    </message>
    <message>
        <source>One file of up to 4 GiB.</source>
        <translation>Eine Datei von höchstens 4 GiB.</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>Hochladen</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>Das Hochladen konnte nicht gestartet werden.</translation>
    </message>
</context>
<context>
    <name>UploadFirmwareDialog</name>
    <message>
        <source>Upload Firmware</source>
        <translation>Firmware hochladen</translation>
    </message>
    <message>
        <source>Only devices whose last upload failed</source>
        <translation>Nur Geräte, deren letztes Hochladen fehlgeschlagen ist</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>Hochladen</translation>
    </message>
    <message>
        <source>Open Firmware Image</source>
        <translation>Firmware-Image öffnen</translation>
    </message>
    <message>
        <source>Firmware file</source>
        <translation>Firmware-Datei</translation>
    </message>
    <message>
        <source>Models of the devices</source>
        <translation>Modelle der Geräte</translation>
    </message>
    <message>
        <source>The last upload failed on none of the devices.</source>
        <translation>Bei keinem der Geräte ist das letzte Hochladen fehlgeschlagen.</translation>
    </message>
    <message>
        <source>When</source>
        <translation>Wann</translation>
    </message>
    <message>
        <source>Rollout</source>
        <translation>Verteilung</translation>
    </message>
    <message>
        <source>%1 at a time</source>
        <translation>%1 zugleich</translation>
    </message>
    <message>
        <source>The first line of this image is damaged; every device would refuse it.</source>
        <translation>Die erste Zeile dieses Images ist beschädigt; jedes Gerät würde es ablehnen.</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: the image is for another model group.</source>
        <translation>
            <numerusform>%n Gerät wird fehlschlagen: das Image ist für eine andere Modellgruppe.</numerusform>
            <numerusform>%n Geräte werden fehlschlagen: das Image ist für eine andere Modellgruppe.</numerusform>
        </translation>
    </message>
    <message>
        <source>Another model group</source>
        <translation>Andere Modellgruppe</translation>
    </message>
    <message>
        <source>Schedule for %1, then %2</source>
        <translation>Für %1 planen, dann %2</translation>
    </message>
    <message>
        <source>Upload to %1, then %2</source>
        <translation>Auf %1 laden, dann %2</translation>
    </message>
    <message>
        <source>Schedule for %1</source>
        <translation>Für %1 planen</translation>
    </message>
    <message>
        <source>Upload to %1</source>
        <translation>Auf %1 laden</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>Das Hochladen konnte nicht gestartet werden.</translation>
    </message>
    <message>
        <source>One file of up to 4 GiB.</source>
        <translation>Eine Datei von höchstens 4 GiB.</translation>
    </message>
</context>
<context>
    <name>UploadHttpsDialog</name>
    <message>
        <source>Upload Certificate – HTTPS</source>
        <translation>Zertifikat hochladen – HTTPS</translation>
    </message>
    <message>
        <source>Generate self-signed certificates</source>
        <translation>Selbst signierte Zertifikate erzeugen</translation>
    </message>
    <message>
        <source>Install certificates</source>
        <translation>Zertifikate installieren</translation>
    </message>
    <message>
        <source>Upload certificates and private keys</source>
        <translation>Zertifikate und private Schlüssel hochladen</translation>
    </message>
    <message>
        <source>HTTP and HTTPS</source>
        <translation>HTTP und HTTPS</translation>
    </message>
    <message>
        <source>HTTPS only</source>
        <translation>Nur HTTPS</translation>
    </message>
    <message>
        <source>Method</source>
        <translation>Methode</translation>
    </message>
    <message>
        <source>Mode</source>
        <translation>Modus</translation>
    </message>
    <message>
        <source>HTTPS Port</source>
        <translation>HTTPS-Port</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) with HTTP on this port already.</source>
        <translation>
            <numerusform>%n Gerät mit HTTP auf diesem Port.</numerusform>
            <numerusform>%n Geräte mit HTTP auf diesem Port.</numerusform>
        </translation>
    </message>
    <message>
        <source>HTTP port</source>
        <translation>HTTP-Port</translation>
    </message>
</context>
<context>
    <name>UploadIeeeDialog</name>
    <message>
        <source>Upload Certificate – IEEE 802.1x</source>
        <translation>Zertifikat hochladen – IEEE 802.1x</translation>
    </message>
    <message>
        <source>For encrypted private keys</source>
        <translation>Für verschlüsselte private Schlüssel</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>Passwort</translation>
    </message>
    <message>
        <source>Private Key Password</source>
        <translation>Passwort des privaten Schlüssels</translation>
    </message>
    <message>
        <source>Method</source>
        <translation>Methode</translation>
    </message>
    <message>
        <source>Identity</source>
        <translation>Identität</translation>
    </message>
    <message>
        <source>CA Certificate</source>
        <translation>CA-Zertifikat</translation>
    </message>
    <message>
        <source>Type the identity that the devices log in with.</source>
        <translation>Die Identität eingeben, mit der sich die Geräte anmelden.</translation>
    </message>
    <message>
        <source>Type the password that the devices log in with.</source>
        <translation>Das Passwort eingeben, mit dem sich die Geräte anmelden.</translation>
    </message>
    <message>
        <source>Choose the certificate of the authority.</source>
        <translation>Das Zertifikat der Zertifizierungsstelle wählen.</translation>
    </message>
</context>
<context>
    <name>UploadPackageDialog</name>
    <message>
        <source>Upload Package</source>
        <translation>Paket hochladen</translation>
    </message>
    <message>
        <source>Package</source>
        <translation>Paket</translation>
    </message>
    <message>
        <source>Choose Package</source>
        <translation>Paket wählen</translation>
    </message>
    <message>
        <source>One file of up to 4 GiB.</source>
        <translation>Eine Datei von höchstens 4 GiB.</translation>
    </message>
    <message>
        <source>Store the package on the memory card</source>
        <translation>Das Paket auf der Speicherkarte ablegen</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>Hochladen</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: no memory card is ready.</source>
        <translation>
            <numerusform>%n Gerät wird fehlschlagen: keine Speicherkarte ist bereit.</numerusform>
            <numerusform>%n Geräte werden fehlschlagen: keine Speicherkarte ist bereit.</numerusform>
        </translation>
    </message>
    <message>
        <source>No memory card ready</source>
        <translation>Keine Speicherkarte bereit</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) may fail: the memory card is almost full.</source>
        <translation>
            <numerusform>%n Gerät kann fehlschlagen: die Speicherkarte ist fast voll.</numerusform>
            <numerusform>%n Geräte können fehlschlagen: die Speicherkarte ist fast voll.</numerusform>
        </translation>
    </message>
    <message>
        <source>Memory card almost full</source>
        <translation>Speicherkarte fast voll</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>Das Hochladen konnte nicht gestartet werden.</translation>
    </message>
</context>
<context>
    <name>WelcomePage</name>
    <message>
        <source>Log in</source>
        <translation>Anmelden</translation>
    </message>
    <message>
        <source>Checking the service on this computer...</source>
        <translation>Der Dienst auf diesem Computer wird geprüft...</translation>
    </message>
</context>
<context>
    <name>main</name>
    <message>
        <source>Norvell Device Manager</source>
        <translation>Norvell Device Manager</translation>
    </message>
</context>
</TS>
