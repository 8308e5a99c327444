<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="fr">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>ligne %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Impossible d’ouvrir le fichier «&#xa0;%1&#xa0;» en lecture</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>Les blocs du fichier sont trop profondément imbriqués.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Impossible d’ouvrir le fichier «&#xa0;%1&#xa0;» en écriture</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>Durée en secondes non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>La liste «&#xa0;%1&#xa0;» contient au moins une adresse IP non valide</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>Nom de domaine non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>Adresse MAC non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>Durée en secondes non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Erreur de modification du sous-réseau. Sous-réseau non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>Adresse IP non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>Erreur de modification de la plage. Impossible de modifier une plage dans «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>Erreur de modification de la plage. Les attributs du sous-réseau parent ne sont pas valides</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>Erreur de modification de la plage. Le sous-réseau parent n’est pas valide</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>Erreur de modification de la plage. Première adresse IP non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>Erreur de modification de la plage. Dernière adresse IP non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>Erreur d’ajout du réseau partagé. Impossible d’ajouter un réseau partagé à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Erreur d’ajout du sous-réseau. Sous-réseau non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>Erreur d’ajout du sous-réseau. Impossible d’ajouter un sous-réseau à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>Erreur d’ajout de la plage. Impossible d’ajouter une plage à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>Erreur d’ajout de la plage. Les attributs du sous-réseau parent ne sont pas valides</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>Erreur d’ajout de la plage. Le sous-réseau parent n’est pas valide</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>Erreur d’ajout de la plage. Première adresse IP non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>Erreur d’ajout de la plage. Dernière adresse IP non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>Erreur d’ajout de l’hôte. Impossible d’ajouter un hôte à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>Erreur d’ajout de l’hôte. Le nom d’hôte ne peut pas être vide.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>Erreur d’ajout de l’adresse fixe. Impossible d’ajouter une adresse fixe à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>Erreur d’ajout de l’adresse fixe. Adresse IP non valide&#xa0;: «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>Erreur d’ajout des paramètres de bind9. Impossible d’ajouter des paramètres de bind9 à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>Erreur d’ajout des paramètres de bind9. Les paramètres de bind9 ne peuvent pas être vides.</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>Erreur d’ajout de la déclaration. Impossible d’ajouter une déclaration à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>Erreur d’ajout du paramètre. Impossible d’ajouter un paramètre à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>Erreur d’ajout de la route statique. Les paramètres de la route statique ne peuvent pas être vides.</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>Erreur d’ajout de la durée du bail. Impossible d’ajouter une durée de bail à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>Erreur d’ajout de la route statique. Impossible d’ajouter une route statique à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>Erreur d’ajout des passerelles. Impossible d’ajouter des passerelles à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>Erreur d’ajout des serveurs DNS. Impossible d’ajouter des serveurs DNS à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>Erreur d’ajout des adresses de serveurs NTP. Impossible d’ajouter des serveurs NTP à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>Erreur d’ajout du nom de domaine. Impossible d’ajouter un nom de domaine à «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>Erreur de modification de «&#xa0;%1&#xa0;». Le bloc serait trop profondément imbriqué.</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>Tout le réseau</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>Sous-réseau</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>Réseau partagé</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>Hôte</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Plage</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>Adresse fixe</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>Informations de la clé</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>Zone du serveur DNS</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Groupe</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> mois </translation>
    </message>
    <message>
        <source> days </source>
        <translation> j </translation>
    </message>
    <message>
        <source> hours </source>
        <translation> h </translation>
    </message>
    <message>
        <source> minutes </source>
        <translation> min </translation>
    </message>
    <message>
        <source> seconds </source>
        <translation> s </translation>
    </message>
    <message>
        <source>Gateways</source>
        <translation>Passerelles</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>Serveurs DNS</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>Serveurs NTP</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>Nom de domaine</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>Route statique (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>Route statique</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Adresse MAC</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>Durée maximale du bail</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>Durée du bail par défaut</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>Clé</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>Algorithme de la clé</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>Secret de la clé</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>Serveur DNS primaire</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>Adresse IP</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Adresse MAC</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>Nom d’hôte</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>État du bail</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>Début du bail</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>Fin du bail</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Impossible d’ouvrir le fichier «&#xa0;%1&#xa0;» en lecture</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>Nom de domaine&#xa0;:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configurer le serveur DHCP</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>Topologie</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>Baux</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Rechercher</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>Résultat précédent</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>Résultat suivant</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Fichier</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Serveur</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>Barre d’outils</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Recharger</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Enregistrer</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Quitter</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>Redémarrer le serveur DHCP</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Choisir les interfaces</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>Démarrer le serveur DHCP</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>Démarrer ou arrêter le serveur DHCP</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>Ajouter un sous-réseau</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>Ajouter un réseau partagé</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>Ajouter un hôte</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>Ajouter une plage</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>Ajouter un paramètre en mode texte</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>Ajouter une déclaration en mode texte</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifier</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>Ajouter une adresse IP fixe</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>Ajouter des serveurs DNS</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>Ajouter un nom de domaine</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>Ajouter des passerelles</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>Ajouter des serveurs NTP</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>Ajouter une durée de bail par défaut</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>Ajouter une durée maximale de bail</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>Réserver une adresse IP</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>Ajouter une route statique</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>Ajouter la mise à jour dynamique du DNS</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>%1 de plus</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 et %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>La configuration n’a pas pu être lue, il n’y a donc rien à enregistrer.</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>Le texte serait trop long, ou ses blocs trop profondément imbriqués, pour être relu.</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>La configuration a été modifiée par ailleurs.
Voulez-vous l’écraser&#xa0;?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>La configuration actuelle du fichier sera remplacée.
Voulez-vous enregistrer les modifications&#xa0;?</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>Le serveur DHCP refuse cette configuration&#xa0;:
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>Réponse du serveur DHCP</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>Le commentaire du fichier ne sera pas conservé.</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>Les %1 commentaires du fichier ne seront pas conservés.</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>Le texte entre guillemets de la ligne %1 sera modifié.</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>Les textes entre guillemets des lignes %1 seront modifiés.</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>L’instruction de la ligne %1 sera modifiée.</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>Les instructions des lignes %1 seront modifiées.</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>Le retour chariot de la ligne %1 fera partie d’un mot.</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>Les retours chariot des lignes %1 feront partie de mots.</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>Déclaration&#xa0;:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>Modifier la déclaration en mode texte</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>Modifier le réseau partagé</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>Modifier le sous-réseau</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>Modifier la plage</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>Modifier l’hôte</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>L’adresse IP est réservée.
Aller à la topologie&#xa0;?</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>Ajouter une adresse fixe</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>Modifier l’adresse fixe</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>Modifier la route statique</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>Ajouter la configuration qui relie automatiquement le serveur DHCP au serveur DNS bind9&#xa0;?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>Choisir la configuration de bind9 qui contient la clé de mise à jour</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>Ces zones ont été ignorées&#xa0;:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1&#xa0;: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>le serveur de noms n’en est pas le serveur primaire</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>aucune clé ne peut la mettre à jour</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>le serveur DHCP n’accepte pas son nom</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>sa clé «&#xa0;%1&#xa0;» est inconnue</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>le serveur DHCP n’accepte pas sa clé «&#xa0;%1&#xa0;»</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>sa clé «&#xa0;%1&#xa0;» se trouve après cet endroit dans la configuration</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valeur</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>Voulez-vous recharger la configuration à partir du fichier&#xa0;?</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>Confirmation</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>Des modifications n’ont pas été enregistrées. Les enregistrer&#xa0;?</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Actions</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Effacer la recherche</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>Modifier les passerelles</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>Passerelles&#xa0;:</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>Modifier les serveurs DNS</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>Serveurs DNS&#xa0;:</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>Modifier les serveurs NTP</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>Serveurs NTP&#xa0;:</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>Modifier le nom de domaine</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>Modifier la durée du bail par défaut</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>Modifier la durée maximale du bail</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>Modifier l’adresse MAC</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>Modifier la durée</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>Paramètre&#xa0;:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>Modifier le paramètre en mode texte</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>Arrêter le serveur DHCP</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>Attention&#xa0;!</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>Ce mode de modification est destiné aux utilisateurs expérimentés.
Après ces modifications, la configuration peut être incorrecte.
Voulez-vous continuer&#xa0;?</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>Ajouter une option</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>Ajouter un paramètre</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>Baux trouvés&#xa0;: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>Aucun bail trouvé</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>Introuvable</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Sommaire</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Rechercher</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Précédent</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nom&#xa0;:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Adresse MAC&#xa0;:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>Adresse IP fixe&#xa0;:</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>Adresse IP&#xa0;:</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Adresse MAC&#xa0;:</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>Adresses IP</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Ajouter</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>Ajouter une adresse IP</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configurer le serveur DHCP</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Aide</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Page de manuel</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>À propos de %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>À propos de Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>Logiciel libre distribué sous la licence publique générale GNU, version 3 ou ultérieure. Il est fourni sans aucune garantie, dans les limites permises par la loi.</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Manuel</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>Masque de réseau</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>Réseau IP</translation>
    </message>
    <message>
        <source>Gateway</source>
        <translation>Passerelle</translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <source>Available interfaces</source>
        <translation>Interfaces disponibles</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Choisir les interfaces</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>Aucune interface disponible n’a été trouvée&#xa0;!</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>Ce programme doit être exécuté par le superutilisateur</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>Interrogation de l’état du serveur DHCP…</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>Le serveur DHCP est en cours d’exécution</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>Le serveur DHCP est arrêté</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>Le serveur DHCP est déjà en cours d’exécution</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>Le serveur DHCP est déjà arrêté</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>L’interrogation de l’état du serveur DHCP a échoué
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>Une autre opération sur le serveur DHCP est déjà en cours</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>L’opération sur le serveur DHCP a échoué
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Impossible d’ouvrir le fichier «&#xa0;%1&#xa0;» en lecture</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Impossible d’ouvrir le fichier «&#xa0;%1&#xa0;» en écriture</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>Le choix des interfaces n’est pas enregistré, car le fichier «&#xa0;%1&#xa0;» ne contient pas de ligne avec «&#xa0;%2&#xa0;»</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>Erreur</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>Le programme ne démarre pas, car il ne peut pas déterminer s’il est déjà en cours d’exécution&#xa0;: il n’y a pas de dossier «&#xa0;%1&#xa0;» accessible au seul superutilisateur.</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>Première adresse IP&#xa0;:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>Dernière adresse IP&#xa0;:</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nom&#xa0;:</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>Attributs&#xa0;:</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>Routes statiques</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Ajouter</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Supprimer</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>Route pour les systèmes MS</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>Une cellule est vide.
Remplissez-la pour valider les routes.</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>Adresse&#xa0;:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>Masque de réseau&#xa0;:</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Boîte de dialogue</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>Mois&#xa0;:</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>Jours&#xa0;:</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>Heures</translation>
    </message>
    <message>
        <source> h</source>
        <translation> h</translation>
    </message>
    <message>
        <source>:</source>
        <translation>:</translation>
    </message>
    <message>
        <source>Minutes</source>
        <translation>Minutes</translation>
    </message>
    <message>
        <source> m</source>
        <translation> min</translation>
    </message>
    <message>
        <source>Seconds</source>
        <translation>Secondes</translation>
    </message>
    <message>
        <source> s</source>
        <translation> s</translation>
    </message>
</context>
<context>
    <name>fileio</name>
    <message>
        <source>The old content cannot be kept while it is overwritten</source>
        <translation>L’ancien contenu ne peut pas être conservé pendant l’écrasement</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1. Le fichier est endommagé, son ancien contenu est conservé dans %2</translation>
    </message>
</context>
</TS>
