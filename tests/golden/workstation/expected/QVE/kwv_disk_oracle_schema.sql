drop table KWX_Fixed_and_removable_disks cascade constraints ;

create table KWX_Fixed_and_removable_disks (
   HARDWARE_SYSTEM_ID varchar2(64) NOT NULL,
   CONFIG_CHANGE_TYPE varchar2(12) NOT NULL,
   CONFIG_CHANGE_TIME varchar2(32) NOT NULL,
   Row_Index varchar2(5) NOT NULL,
   DeviceID varchar2(64) NULL,
   Drive_Name varchar2(30) NULL,
   siz_ varchar2(20) NULL,
   Removable varchar2(32) NULL,
   Name varchar2(255) NULL,
   Capacity varchar2(20) NULL,
   DeviceID8 varchar2(255) NULL,
   Speed varchar2(20) NULL );

create unique index KWX_IFixed_and_removable_disks on KWX_Fixed_and_removable_disks
(
   HARDWARE_SYSTEM_ID,
   CONFIG_CHANGE_TYPE,
   CONFIG_CHANGE_TIME,
   Row_Index
);

alter table KWX_Fixed_and_removable_disks add ( primary key ( HARDWARE_SYSTEM_ID, CONFIG_CHANGE_TYPE, Row_Index ));

drop view KWX_VFixed_and_removable_disks;

create view KWX_VFixed_and_removable_disks
as
select
   COMPUTER_SYSTEM.QVE_OBJECT_ID,
   COMPUTER_SYSTEM.QVE_OBJECT_LABEL,
   KWX_Fixed_and_removable_disks.*
from
   COMPUTER_SYSTEM, KWX_Fixed_and_removable_disks
where
   COMPUTER_SYSTEM.HARDWARE_SYSTEM_ID =
   KWX_Fixed_and_removable_disks.HARDWARE_SYSTEM_ID;

insert into QUERY_VIEWS (VIEW_NAME) values ('KWX_VFixed_and_removable_disks');
