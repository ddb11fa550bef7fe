<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es_ES">
<context>
    <name>DestinationsScreen</name>
    <message>
        <source>Destinations</source>
        <translation>Destinos</translation>
    </message>
</context>
<context>
    <name>GuidancePanel</name>
    <message>
        <source>Arrival %1</source>
        <translation>Llegada %1</translation>
    </message>
    <message>
        <source>Pause</source>
        <translation>Pausa</translation>
    </message>
    <message>
        <source>Demonstration</source>
        <translation>Demostración</translation>
    </message>
    <message>
        <source>Route</source>
        <translation>Ruta</translation>
    </message>
    <message>
        <source>End</source>
        <translation>Terminar</translation>
    </message>
</context>
<context>
    <name>Manoeuvres</name>
    <message>
        <source>Set off</source>
        <translation>Salir</translation>
    </message>
    <message>
        <source>Go straight on</source>
        <translation>Seguir recto</translation>
    </message>
    <message>
        <source>Bear left</source>
        <translation>Mantenerse a la izquierda</translation>
    </message>
    <message>
        <source>Bear right</source>
        <translation>Mantenerse a la derecha</translation>
    </message>
    <message>
        <source>Turn left</source>
        <translation>Girar a la izquierda</translation>
    </message>
    <message>
        <source>Turn right</source>
        <translation>Girar a la derecha</translation>
    </message>
    <message>
        <source>Turn sharp left</source>
        <translation>Giro cerrado a la izquierda</translation>
    </message>
    <message>
        <source>Turn sharp right</source>
        <translation>Giro cerrado a la derecha</translation>
    </message>
    <message>
        <source>Turn round</source>
        <translation>Dar la vuelta</translation>
    </message>
    <message>
        <source>You arrive</source>
        <translation>Ha llegado</translation>
    </message>
</context>
<context>
    <name>MapScreen</name>
    <message>
        <source>Navigation</source>
        <translation>Navegación</translation>
    </message>
    <message>
        <source>Back to the vehicle</source>
        <translation>Volver al vehículo</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>Acercar</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>Alejar</translation>
    </message>
</context>
<context>
    <name>Modules</name>
    <message>
        <source>Navigation</source>
        <translation>Navegación</translation>
    </message>
</context>
<context>
    <name>NavigationSettings</name>
    <message>
        <source>Navigation</source>
        <translation>Navegación</translation>
    </message>
</context>
<context>
    <name>NavigationSettingsScreen</name>
    <message>
        <source>Navigation settings</source>
        <translation>Ajustes de navegación</translation>
    </message>
    <message>
        <source>Avoid motorways</source>
        <translation>Evitar autopistas</translation>
    </message>
    <message>
        <source>Show turns on other screens</source>
        <translation>Giros en otras pantallas</translation>
    </message>
</context>
<context>
    <name>Navigator</name>
    <message>
        <source>The map does not have this place</source>
        <translation>El mapa no tiene este lugar</translation>
    </message>
    <message>
        <source>There is no destination</source>
        <translation>No hay destino</translation>
    </message>
</context>
<context>
    <name>PlaceCategories</name>
    <message>
        <source>All places</source>
        <translation>Todos los lugares</translation>
    </message>
    <message>
        <source>Work</source>
        <translation>Trabajo</translation>
    </message>
    <message>
        <source>Fuel</source>
        <translation>Combustible</translation>
    </message>
    <message>
        <source>Charging</source>
        <translation>Carga</translation>
    </message>
    <message>
        <source>Parking</source>
        <translation>Aparcamiento</translation>
    </message>
    <message>
        <source>Eating</source>
        <translation>Comer</translation>
    </message>
    <message>
        <source>Sights</source>
        <translation>Qué ver</translation>
    </message>
    <message>
        <source>Health</source>
        <translation>Salud</translation>
    </message>
    <message>
        <source>Train and ferry</source>
        <translation>Tren y ferri</translation>
    </message>
    <message>
        <source>Home</source>
        <translation>Casa</translation>
    </message>
</context>
<context>
    <name>RouteScreen</name>
    <message>
        <source>Route</source>
        <translation>Ruta</translation>
    </message>
    <message>
        <source>No destination</source>
        <translation>Sin destino</translation>
    </message>
</context>
<context>
    <name>StartPanel</name>
    <message>
        <source>Where to?</source>
        <translation>¿Adónde?</translation>
    </message>
</context>
</TS>
