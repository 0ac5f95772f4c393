drop table KWX_Network_Zones cascade constraints ;

create table KWX_Network_Zones (
   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,
   Row_Index varchar2(5) NOT NULL,
   Name varchar2(8) NULL,
   State varchar2(255) NULL,
   Name4 varchar2(255) NULL,
   Place varchar2(255) NULL );

create unique index KWX_INetwork_Zones on KWX_Network_Zones
(
   HARDWARE_SYSTEM_ID,
   CONFIG_CHANGE_TYPE,
   CONFIG_CHANGE_TIME,
   Row_Index
);

alter table KWX_Network_Zones add ( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index ));

drop view KWX_VNetwork_Zones;

create view KWX_VNetwork_Zones
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Network_Zones.*
from
   COMPUTER_SYSTEM, KWX_Network_Zones
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Network_Zones.HARDWARE_SYSTEM_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VNetwork_Zones');
